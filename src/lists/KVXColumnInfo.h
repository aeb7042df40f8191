// KVXColumnInfo: one column of an extended list control (title, position, sub-item,
// width, alignment, column type code) and its byte record for files and drags.
#pragma once

#include <afxwin.h>

class AFX_EXT_CLASS KVXColumnInfo : public CObject
{
// Constructors
public:
    KVXColumnInfo();
    KVXColumnInfo(int nIndex, CString strTitle, int nSubItem, int nWidth, int nFormat);
    virtual ~KVXColumnInfo();

    // Copies all six fields.
    KVXColumnInfo& operator=(const KVXColumnInfo& other);

// Attributes
    void SetTitle(CString strTitle);
    CString GetTitle() const;
    void SetIndex(int nIndex);
    int GetIndex() const;
    void SetSubItem(int nSubItem);
    int GetSubItem() const;
    void SetWidth(int nWidth);
    int GetWidth() const;
    void SetFormat(int nFormat);
    int GetFormat() const;
    void SetSortType(unsigned char nSortType);
    unsigned char GetSortType() const;

// Operations
    // The record at the file's position: the title in the ANSI code page with a
    // terminating zero, then index, sub-item, width and format (4 bytes each,
    // little-endian) and the sort type byte: title length + 18 bytes.
    void Write(CFile* pFile);
    // Appends the stored title to this record's title and reads the fields after it.
    // The end of the data ends the title; a field the data does not hold in full
    // keeps its value. File exceptions pass to the caller.
    void Read(CFile* pFile);

// Implementation
protected:
    unsigned char m_nSortType;
    int m_nFormat;
    int m_nWidth;
    int m_nSubItem;
    int m_nIndex;
    CString m_strTitle;
};
