// Scope guards for GDI: each destructor releases what its constructor acquired, with one type per
// way of releasing. They live no longer than a function call; handles that a record keeps are plain
// fields.
#pragma once

#include "platform/platform.h"

namespace kor {

// Selects an object into a DC and restores the previous one. A null object selects nothing.
class SelectScope {
public:
    SelectScope(HDC dc, HGDIOBJ object) noexcept
        : dc_(dc), previous_(object ? SelectObject(dc, object) : nullptr) {}
    SelectScope(HDC, HRGN) = delete;  // a region is copied, and the result is an integer
    ~SelectScope() {
        if (previous_) SelectObject(dc_, previous_);
    }
    SelectScope(const SelectScope&) = delete;
    SelectScope& operator=(const SelectScope&) = delete;

private:
    HDC dc_;
    HGDIOBJ previous_;
};

// A pen, brush, font or bitmap that is deleted at the end of the scope. Declare it before the
// SelectScope that selects it, so that it is deselected before it is deleted.
template <typename Handle>
class LocalGdiObject {
public:
    explicit LocalGdiObject(Handle object) noexcept : object_(object) {}
    ~LocalGdiObject() {
        if (object_) DeleteObject(object_);
    }
    LocalGdiObject(const LocalGdiObject&) = delete;
    LocalGdiObject& operator=(const LocalGdiObject&) = delete;

    Handle get() const noexcept { return object_; }

private:
    Handle object_;
};

// A window's DC. A null window gives a null DC, not the screen's.
class WindowDC {
public:
    explicit WindowDC(HWND hwnd) noexcept : hwnd_(hwnd), dc_(hwnd ? GetDC(hwnd) : nullptr) {}
    ~WindowDC() {
        if (dc_) ReleaseDC(hwnd_, dc_);
    }
    WindowDC(const WindowDC&) = delete;
    WindowDC& operator=(const WindowDC&) = delete;

    HDC get() const noexcept { return dc_; }

private:
    HWND hwnd_;
    HDC dc_;
};

// A memory DC compatible with `like`, or with the screen when that is null.
class MemoryDC {
public:
    explicit MemoryDC(HDC like) noexcept : dc_(CreateCompatibleDC(like)) {}
    ~MemoryDC() {
        if (dc_) DeleteDC(dc_);
    }
    MemoryDC(const MemoryDC&) = delete;
    MemoryDC& operator=(const MemoryDC&) = delete;

    HDC get() const noexcept { return dc_; }

private:
    HDC dc_;
};

// BeginPaint and EndPaint. When BeginPaint fails the DC is null and the area empty.
class PaintScope {
public:
    explicit PaintScope(HWND hwnd) noexcept : hwnd_(hwnd) { dc_ = BeginPaint(hwnd_, &paint_); }
    ~PaintScope() { EndPaint(hwnd_, &paint_); }
    PaintScope(const PaintScope&) = delete;
    PaintScope& operator=(const PaintScope&) = delete;

    HDC dc() const noexcept { return dc_; }
    const RECT& area() const noexcept { return paint_.rcPaint; }

private:
    HWND hwnd_;
    HDC dc_;
    PAINTSTRUCT paint_ = {};
};

}  // namespace kor
