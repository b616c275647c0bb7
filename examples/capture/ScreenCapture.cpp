// SPDX-License-Identifier: MIT
#include "ScreenCapture.h"

#include <QPainter>

#include <algorithm>
#include <stdexcept>

// X's headers come last, because they define macros with common names, such as None.
#include <X11/Xlib.h>
#include <X11/Xutil.h>
#include <X11/extensions/Xcomposite.h>

namespace {

// Holds the X server still: while this object lives, no window comes, goes or moves.
class Standstill
{
public:
    explicit Standstill(Display *display)
        : m_display(display)
    {
        XGrabServer(m_display);
    }
    ~Standstill()
    {
        XUngrabServer(m_display);
        XFlush(m_display);
    }
    Standstill(const Standstill &) = delete;
    Standstill &operator=(const Standstill &) = delete;

private:
    Display *const m_display;
};

// By default the library ends the process at an error. Here an error shows in the missing answer.
int passOver(Display *, XErrorEvent *)
{
    return 0;
}

// Paints the pixels of `window`, which is on the screen and has `attributes`, where it is.
void paintWindow(
    QPainter &painter, Display *display, Window window, const XWindowAttributes &attributes)
{
    constexpr int depthWithAlpha = 32;
    constexpr int bitsOfAPixel = 32;
    const int border = attributes.border_width;
    const int width = attributes.width + 2 * border;
    const int height = attributes.height + 2 * border;
    const Pixmap pixels = XCompositeNameWindowPixmap(display, window);
    XImage *const image = XGetImage(display, pixels, 0, 0, static_cast<unsigned>(width),
        static_cast<unsigned>(height), AllPlanes, ZPixmap);
    if (image && image->bits_per_pixel == bitsOfAPixel) {
        const auto format = attributes.depth == depthWithAlpha ? QImage::Format_ARGB32_Premultiplied
                                                               : QImage::Format_RGB32;
        painter.drawImage(attributes.x, attributes.y,
            QImage(reinterpret_cast<const uchar *>(image->data), width, height,
                image->bytes_per_line, format));
    }
    if (image)
        XDestroyImage(image);
    XFreePixmap(display, pixels);
}

} // namespace

ScreenCapture::ScreenCapture()
    : m_display(XOpenDisplay(nullptr))
{
    if (!m_display)
        throw std::runtime_error("there is no X server");
    int firstEvent = 0;
    int firstError = 0;
    if (!XCompositeQueryExtension(m_display, &firstEvent, &firstError)) {
        XCloseDisplay(m_display);
        throw std::runtime_error("the X server does not keep windows apart");
    }
    XSetErrorHandler(passOver);
    XCompositeRedirectSubwindows(
        m_display, DefaultRootWindow(m_display), CompositeRedirectAutomatic);
    XSync(m_display, False);
}

ScreenCapture::~ScreenCapture()
{
    XCloseDisplay(m_display);
}

std::vector<unsigned long> ScreenCapture::childrenOfRoot() const
{
    Window root = 0;
    Window parent = 0;
    Window *children = nullptr;
    unsigned count = 0;
    if (!XQueryTree(m_display, DefaultRootWindow(m_display), &root, &parent, &children, &count))
        return {};
    const std::vector<unsigned long> windows(children, children + count); // the undermost first
    XFree(children);
    return windows;
}

// A window manager puts a window into a frame of its own. The frame is what has to be left out.
unsigned long ScreenCapture::childOfRootAround(unsigned long window) const
{
    for (;;) {
        Window root = 0;
        Window parent = 0;
        Window *children = nullptr;
        unsigned count = 0;
        if (!XQueryTree(m_display, window, &root, &parent, &children, &count))
            return 0; // there is no such window
        XFree(children);
        if (parent == root || parent == 0)
            return window;
        window = parent;
    }
}

QImage ScreenCapture::picture(const std::vector<WId> &leftOut) const
{
    const Standstill standstill(m_display);
    std::vector<unsigned long> framesLeftOut;
    for (const WId window : leftOut)
        framesLeftOut.push_back(childOfRootAround(window));

    const int screen = DefaultScreen(m_display);
    QImage picture(
        DisplayWidth(m_display, screen), DisplayHeight(m_display, screen), QImage::Format_RGB32);
    picture.fill(Qt::black);
    QPainter painter(&picture);
    for (const unsigned long window : childrenOfRoot()) {
        if (std::find(framesLeftOut.begin(), framesLeftOut.end(), window) != framesLeftOut.end())
            continue;
        XWindowAttributes attributes {};
        if (XGetWindowAttributes(m_display, window, &attributes)
            && attributes.map_state == IsViewable && attributes.c_class == InputOutput)
            paintWindow(painter, m_display, window, attributes);
    }
    return picture;
}
