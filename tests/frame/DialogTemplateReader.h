// Reads a classic (non-extended) dialog template resource into plain values, so
// that tests can check styles, sizes, captions and controls as the library ships them.
#pragma once

#include <windows.h>

#include <string>
#include <vector>

struct DialogControlInfo
{
    DWORD style = 0;
    short x = 0, y = 0, cx = 0, cy = 0;
    WORD id = 0;
    std::wstring className;   // "Button", "Static", ... for predefined atoms
    std::wstring text;
};

struct DialogTemplateInfo
{
    bool valid = false;
    DWORD style = 0;
    short cx = 0, cy = 0;
    std::wstring caption;
    WORD pointSize = 0;
    std::wstring fontName;
    std::vector<DialogControlInfo> controls;
};

// size: bytes available at data; a template that runs past them is reported invalid.
DialogTemplateInfo ReadDialogTemplate(const void* data, size_t size);
