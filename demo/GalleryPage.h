// A page of the gallery: a child window that shows one family of controls.
// Pages register themselves with GALLERY_PAGE; the gallery creates them in order.
#pragma once

#include <afxwin.h>
#include <afxcmn.h>

class CGalleryPage : public CWnd
{
public:
    // The font of the page's labels and buttons.
    static CFont* GuiFont();
    // Whether the gallery runs to write its screenshots ("/screenshots <folder>").
    static bool InScreenshotMode();
    // State images of check boxes: 1 a clear box, 2 a checked one, as the system draws
    // check buttons, in a 16 x 16 image list created here.
    static void CreateCheckBoxImages(CImageList& images, CWnd* pWnd);

    // Text of the page's tab.
    virtual LPCTSTR GetTitle() const = 0;
    // Creates the page's controls; the page window exists and has its final size.
    virtual void CreateControls() = 0;
    // Screenshot mode: further pictures of the page in other states. ShowScreenshotVariant
    // puts the page into variant nVariant (0 to the count - 1) and returns the suffix of
    // its file name.
    virtual int GetScreenshotVariantCount() const { return 0; }
    virtual CString ShowScreenshotVariant(int /*nVariant*/) { return CString(); }
};

typedef CGalleryPage* (*GalleryPageFactory)();

struct GalleryPageEntry
{
    GalleryPageEntry(int order, GalleryPageFactory factory);
    int order;
    GalleryPageFactory factory;
    GalleryPageEntry* next;
};

// Pages in ascending order of registration number.
GalleryPageEntry* GetGalleryPages();

#define GALLERY_PAGE(order, cls) \
    static GalleryPageEntry _galleryPage_##cls(order, []() -> CGalleryPage* { return new cls; })
