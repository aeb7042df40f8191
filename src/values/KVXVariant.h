// KVXVariant.h - one OLE VARIANT carrying a value of the validated edits.
//
// The VARIANT is owned: copies go through VariantCopy, release through VariantClear. Equality is
// that of MFC's COleVariant: same type and same value (VT_EMPTY equals VT_EMPTY; a long 1 is not
// a double 1.0; a NaN equals nothing; texts compare code unit by code unit).
//
// Conversions (GetAs, 0 = KVT_VARIANT_OK, value written only then):
//   - VT_EMPTY converts to 0, 0.0 and the empty text, so a new numeric field shows 0.
//   - Text (VT_BSTR) converts to numbers with the grammar of KVXString::GetAs, not with the
//     locale-dependent OLE parser; numbers convert to text as "%ld" and as the shortest text that
//     reads back as the same double.
//   - A double converts to long rounded to nearest, halves to even (as OLE does); outside the long
//     range: KVT_VARIANT_OVERFLOW; a NaN: KVT_VARIANT_NOT_A_NUMBER.
//   - Every other type goes through VariantChangeType.
// The short argument of GetAs(long&, short) is the flags word of VariantChangeType; the callers
// pass 1 (VARIANT_NOVALUEPROP).
#pragma once

#include <afx.h>
#include <oleauto.h>

#include "KVTEnums.h"
#include "KVXString.h"

class KVT_API KVXVariant
{
public:
// Constructors
    KVXVariant();
    KVXVariant(long lSrc);
    KVXVariant(int nSrc);  // stored as a long; keeps KVXVariant(0) unambiguous
    KVXVariant(double dblSrc);
    KVXVariant(const KVXString& strSrc);
    KVXVariant(const VARIANT& varSrc);
    KVXVariant(const KVXVariant& varSrc);
    virtual ~KVXVariant();

// Assignment
    const KVXVariant& operator=(long lSrc);
    const KVXVariant& operator=(int nSrc);
    const KVXVariant& operator=(double dblSrc);
    const KVXVariant& operator=(const KVXString& strSrc);
    const KVXVariant& operator=(const VARIANT& varSrc);
    const KVXVariant& operator=(const KVXVariant& varSrc);

// Comparison
    bool operator==(const KVXVariant& varSrc) const;
    bool operator!=(const KVXVariant& varSrc) const;

// Conversion
    KVTEnumVariantError GetAs(long& lValue, short nFlags = VARIANT_NOVALUEPROP) const;
    KVTEnumVariantError GetAs(double& dValue) const;
    KVTEnumVariantError GetAs(KVXString& strValue) const;

// Attributes
    VARTYPE GetType() const { return m_var.vt; }
    const VARIANT& GetVariant() const { return m_var; }
    void Clear();  // back to VT_EMPTY

protected:
    VARIANT m_var;
};

// COleVariant's equality on two raw VARIANTs.
KVT_API bool KvtVariantEqual(const VARIANT& var1, const VARIANT& var2);
