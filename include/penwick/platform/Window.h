// SPDX-License-Identifier: MIT
// A top-level window placed by its outer frame.
#pragma once

#include <penwick/Export.h>
#include <penwick/platform/Geometry.h>
#include <penwick/platform/ScreenFrame.h>
#include <penwick/platform/WindowAttributes.h>

#include <QImage>
#include <QPointer>
#include <QWidget>

#include <memory>
#include <vector>

namespace penwick::platform {

class WindowParts;

/// Told of what happens to a window, once for each thing that happened. A delegate is a QObject.
class PENWICK_EXPORT WindowDelegate
{
public:
    virtual ~WindowDelegate();
    virtual void windowWillAppear() { } ///< it is asked to come to the screen
    virtual void windowWillMove() { } ///< the user has begun to move it
    virtual void windowDidMove() { }
    virtual void windowDidResize() { } ///< before windowDidMove() where both changed
    virtual void windowDidResignMain() { } ///< another window of the desktop has taken over
    virtual void windowWillClose() { }
};

/// How the pixels of a window are kept. The values are fixed, but have no effect: the toolkit
/// buffers every window.
enum class BackingStore
{
    Retained = 0,
    Nonretained = 1,
    Buffered = 2
};

enum class Animate
{
    No,
    Yes
};

/// A window whose frame is its outer one, title bar included, in points, y up, from the primary
/// screen's bottom left corner. Inside it, views have frames from the content's bottom left.
///
/// It never ends the host by being the last one closed. GUI thread only: on another thread, or
/// without a QApplication, these operations stop the process.
class PENWICK_EXPORT Window : public QWidget
{
    Q_OBJECT

public:
    explicit Window(QWidget *parent = nullptr);
    /// A window of `styleMask` whose frame is `contentRect`; a title bar takes its room from it.
    /// `backing` and `defer` change nothing: the desktop has the window from its first showing on.
    Window(const Rect &contentRect, StyleMasks styleMask, BackingStore backing, bool defer);
    ~Window() override;

    // Frame

    /// Where the window is. After a request it is what was asked for, unless the desktop grants
    /// something else.
    [[nodiscard]] Rect frame() const;
    /// Asks for `frame` and returns at once. With Animate::Yes a window on the screen glides
    /// there; frame() returns the target meanwhile.
    void setFrame(const Rect &frame, Animate animate = Animate::No);
    void setFrameOrigin(Point origin);

    // Attributes

    [[nodiscard]] const WindowAttributes &attributes() const;
    void setAttributes(const WindowAttributes &attributes);
    /// Whether what lies below the window can be seen where the window is transparent. On a
    /// desktop that cannot, a transparent layer over the screen shows a picture of what was below
    /// it when it was shown. Each time, this is written to the logging category "penwick.desktop"
    /// at the information level.
    [[nodiscard]] bool showsWhatIsBelow() const;

    // Captures of the screen

    /// Whether this desktop keeps the window out of captures of the screen: one whose sharing type
    /// is 0, where the desktop can do that. X11 cannot: there it is false for every window, and
    /// whoever captures leaves out windowsToLeaveOutOfCaptures().
    [[nodiscard]] bool isKeptOutOfCaptures() const;
    /// The native identifiers (QWidget::winId()) of the windows that are not to be seen by a
    /// capture, their sharing type being 0: this one, and those that stand above it or will when
    /// they are shown; of a drawing window the tool bar, its popover and the banner, however often
    /// they come and go. On X11 a window manager puts a window into a frame of its own, which then
    /// has to be left out. Native windows that do not exist yet are made. Tool tips and menus are
    /// the toolkit's and not in the list.
    [[nodiscard]] std::vector<WId> windowsToLeaveOutOfCaptures() const;

    // Child windows

    /// Tells that `child` will be added before it is shown. Until then it is no child, but counts
    /// in windowsToLeaveOutOfCaptures(). A window that is a child already stays one.
    void expectChildWindow(Window &child);
    /// Makes `child` stand above this window: it moves with it, stays where it is when this one is
    /// resized, and is on the screen only while this one is. Puts it on the screen if it can be
    /// there. A child of this window already is only brought to the front.
    void addChildWindow(Window &child);
    /// Lets `child`, which was added or expected, stand by itself from now on, where it is: it is
    /// this window's no longer. Nothing where it is neither.
    void removeChildWindow(Window &child);
    /// The window whose child this is; null without one.
    [[nodiscard]] Window *parentWindow() const;
    [[nodiscard]] std::vector<Window *> childWindows() const; ///< in the order of adding

    // Content

    /// The picture of what has been drawn, as large as the window's content, in its device pixels
    /// and with their number a point as its devicePixelRatio(): the paper (transparent in a layer
    /// over a screen) or the picture that is drawn on, the strokes, the texts. No border, caret,
    /// selection, placeholder, button or tool bar. A text that is being edited is in it.
    ///
    /// A copy of its own, alpha premultiplied, made anew by each call. The window need not be on
    /// the screen; the last chance is the end of the session, inside its notification or later for
    /// as long as the window is there. Null where the content has no size or there is no memory
    /// for it.
    [[nodiscard]] QImage contentImage() const;
    [[nodiscard]] WindowDelegate *delegate() const; ///< null without one, or once it is gone
    void setDelegate(WindowDelegate *delegate); ///< weak

    // Showing and closing

    /// Puts the window in front of the others without making it the key window. A child of a
    /// window that is not on the screen comes up together with that one.
    void orderFront();
    /// Takes the window and its children off the screen without closing it.
    void orderOut();
    /// Tells the delegate that the window closes and takes it off the screen. The window stays
    /// what it is, its native identifier included, and may be shown again. Returns true.
    bool close();

    void setVisible(bool visible) override;

Q_SIGNALS:
    /// windowsToLeaveOutOfCaptures() has changed since it was last asked for, or since this was
    /// last sent. The slot may ask for the list. Not sent when windows go because their session
    /// ends.
    void windowsToLeaveOutOfCapturesChanged();
    /// The desktop has answered, and the window does not glide: frame() and the size of the content
    /// are what is on the screen. Sent after the delegate was told, also if nothing has changed.
    void frameSettled();

protected:
    bool event(QEvent *event) override;
    void changeEvent(QEvent *event) override;
    void closeEvent(QCloseEvent *event) override;
    void keyPressEvent(QKeyEvent *event) override;
    void mouseMoveEvent(QMouseEvent *event) override;
    void mousePressEvent(QMouseEvent *event) override;
    void mouseReleaseEvent(QMouseEvent *event) override;
    void paintEvent(QPaintEvent *event) override;
    void resizeEvent(QResizeEvent *event) override;

private:
    void applyAttributes();
    void orderIn();
    void prepareBackdrop();
    void standAmongOthers();
    void tellDelegate(void (WindowDelegate::*what)());
    void showFamily();
    void hideFamily();
    void raiseFamily();
    void takeFamilyAlong(QPoint delta) const;
    [[nodiscard]] bool canShow() const;

    const std::unique_ptr<WindowParts> d; // what no host needs
    WindowAttributes m_attributes;
    QPointer<QObject> m_delegateObject;
    WindowDelegate *m_delegate = nullptr;
};

} // namespace penwick::platform
