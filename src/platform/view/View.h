// SPDX-License-Identifier: MIT
// A widget as a view: frames are counted from the bottom left, subviews are ordered and shared
// rather than owned, there may be a layer, and events come by the names under which classes
// override them. ViewOf.h makes a view of a widget class.
#pragma once

#include <penwick/platform/Geometry.h>

#include "platform/foundation/WeakReference.h"
#include "platform/view/Cursor.h"
#include "platform/view/Layer.h"
#include "platform/view/NextResponder.h"

#include <cstdint>
#include <memory>
#include <optional>
#include <vector>

class QPainter;
class QWidget;

namespace penwick::platform {

class PanGestureRecognizer;
class ViewHost;

/// Which end of a pen a pointer is; none of a mouse or a finger.
enum class PenEnd
{
    None,
    Tip,
    Eraser
};

/// One press, drag, release or move of the left button's pointer, or of a pen's end.
struct MouseEvent
{
    Point locationInWindow; ///< points from the bottom left corner of the window's content
    int clickCount = 0; ///< 1 for a click, 2 for the second of a double click
    PenEnd penEnd = PenEnd::None;
};

/// One key going down or up.
struct KeyEvent
{
    /// Backspace or Delete, which are one key on some keyboards and two on others; without
    /// modifiers.
    static constexpr int backspaceKeyCode = 51;

    int keyCode = 0; ///< 0 for every key that no view asks about
};

/// The view's half of a widget.
///
/// A subview that somebody else holds outlives its superview; one that a scene built belongs to
/// its superview. A view that removes itself while it handles an event stays valid until the event
/// is over. GUI thread only.
class View
{
public:
    View(const View &) = delete;
    View &operator=(const View &) = delete;
    virtual ~View();

    /// The widget that this view is.
    [[nodiscard]] QWidget &widget() const { return m_widget; }
    /// The widget that shows the view's content: itself, or the viewport of a scrolling widget.
    [[nodiscard]] virtual QWidget &surface() const = 0;

    /// Lets `responder`, a QObject, answer for the view. Weak; null: nobody.
    void setNextResponder(NextResponder *responder) { m_nextResponder = responder; }

    /// Identity: unique in the process, the same for the view's whole life.
    [[nodiscard]] std::int64_t hash() const { return m_hash; }

    // Geometry. Points; frames are in the superview's coordinates, or the window's content for a
    // view that has no superview, with the origin at the bottom left. A frame is kept when the
    // superview is resized.

    [[nodiscard]] Rect frame() const { return m_frame; }
    void setFrame(const Rect &frame);
    void setFrameOrigin(Point origin);
    [[nodiscard]] Rect bounds() const { return { 0.0, 0.0, m_frame.width, m_frame.height }; }
    /// Whether the view's own coordinates run downwards from its top left corner.
    [[nodiscard]] virtual bool isFlipped() const { return false; }
    /// Converts `point` from this view's coordinates to those of `view`; to the window's if `view`
    /// is null.
    [[nodiscard]] Point convertTo(Point point, const View *view) const;
    /// Converts `point` from the coordinates of `view`, or from the window's if `view` is null, to
    /// this view's.
    [[nodiscard]] Point convertFrom(Point point, const View *view) const;

    // The tree.

    [[nodiscard]] View *superview() const { return m_superview; }
    [[nodiscard]] std::vector<View *> subviews() const; ///< the lowest first
    /// Puts `view` on top of the other subviews; one that is a subview already stays where it is.
    void addSubview(const std::shared_ptr<View> &view);
    /// Keeps exactly `views`, which are subviews now, in that order, and removes the others.
    void setSubviews(const std::vector<View *> &views);
    /// Takes the view out of its superview. If it, or a view in it, is its window's first
    /// responder, it resigns first. Without a superview nothing happens.
    void removeFromSuperview();
    /// The window that the view is in, as views see it; null outside of one.
    [[nodiscard]] ViewHost *window() const;
    [[nodiscard]] bool isHidden() const { return m_isHidden; }
    void setHidden(bool hidden);
    /// Whether the view lies above its siblings on the screen, wherever it stands among the
    /// subviews.
    [[nodiscard]] bool isAboveSiblings() const { return m_isAboveSiblings; }
    void setAboveSiblings(bool isAbove);

    // Appearance.

    /// Whether this view asked for a layer.
    [[nodiscard]] bool wantsLayer() const { return m_wantsLayer; }
    void setWantsLayer(bool wantsLayer);
    /// The layer; null unless the view or a view around it asked for one.
    [[nodiscard]] Layer *layer();
    /// Paints the view again before the next event is waited for.
    void setNeedsDisplay();
    /// The same for a part of it, in the view's own coordinates.
    void setNeedsDisplay(const Rect &rect);
    /// Shows `cursor` while the pointer is over `rect`. Only the whole bounds are supported.
    void addCursorRect(const Rect &rect, const Cursor &cursor);

    /// Lets `recognizer` follow the pointer over this view; a press that is being handled is its
    /// first. A recognizer that was added before stays. Borrowed.
    void addGestureRecognizer(PanGestureRecognizer &recognizer);
    void removeGestureRecognizer(PanGestureRecognizer &recognizer);

    // What classes override.

    /// How far the pointer has to move from its press before that is a drag, in points, both axes
    /// added up; with 0 every move is a drag. Asked at every move until one is far enough. That one
    /// is the first mouseDragged(), and from then on every move is one, even back at the place of
    /// the press. Gesture recognizers have a distance of their own.
    [[nodiscard]] virtual double dragDistance() const { return 0.0; }
    /// Whether the view takes a pen's own events, which have fractions of a pixel. Otherwise the
    /// toolkit turns them into a mouse's. A view that takes them has to override all of
    /// mouseDown(), mouseDragged() and mouseUp().
    [[nodiscard]] virtual bool takesPens() const { return false; }

    /// Paints the content; `dirtyRect` is in the view's own coordinates.
    virtual void draw(const Rect &dirtyRect) = 0;
    /// Paints what belongs to the picture of the drawing and nothing else: no layer, no border, no
    /// mark of being edited. Paints nothing unless a class overrides it. `painter` is in points
    /// from the view's top left corner, y down, and is clipped to the view. Also called while the
    /// view is not on the screen.
    virtual void drawContent(QPainter &painter);
    virtual void mouseDown(const MouseEvent &event) = 0;
    virtual void mouseDragged(const MouseEvent &event) = 0; ///< only after a mouseDown()
    virtual void mouseUp(const MouseEvent &event) = 0; ///< only after a mouseDown()
    virtual void mouseMoved(const MouseEvent &event) = 0;
    virtual void mouseEntered() { }
    virtual void mouseExited() { }
    virtual void keyUp(const KeyEvent &event) = 0;
    /// Declares the view's cursors with addCursorRect().
    virtual void resetCursorRects() { }
    /// The scene that the view comes from is complete.
    virtual void awakeFromScene() { }
    /// The view came into a window or left one.
    virtual void viewDidMoveToWindow() { }
    /// The size of the superview has changed; it was `former`.
    virtual void superviewDidResize(Size /*former*/) { }
    /// Asks the view to stop being the first responder; returns whether it does. A view with a next
    /// responder returns that one's answer.
    virtual bool resignFirstResponder();

    /// Paints the view as content, and above it its subviews, the lowest first, each in its place;
    /// `painter` is in points from the top left corner of the widget around the view, y down. A
    /// view for which setHidden(true) was called paints nothing.
    void paintContent(QPainter &painter);
    /// Makes views of the widgets that a scene built below this one: takes the frames from the
    /// widgets' places and enters them as subviews, the lowest first.
    void adoptScene();
    /// Tells this view and those in it that they came into their window or left it.
    void announceWindow();
    /// Takes the cursors as resetCursorRects() declares them now.
    void refreshCursorRects();
    /// Puts the widget where the frame says; called when what is around it was resized.
    void place();

protected:
    explicit View(QWidget &widget);

    void widgetResized(Size former);
    void pressIsComing();
    void keyIsComing();
    void pointerEntered();
    /// The recognizers that follow the pointer now; a copy, because an action may change them.
    [[nodiscard]] std::vector<PanGestureRecognizer *> gestureRecognizers() const;
    /// The place (x, y), in points from the surface's top left corner, y down, in the window's
    /// coordinates.
    [[nodiscard]] Point locationInWindow(double x, double y) const;
    /// `rect`, of this view's coordinates, in those of the surface, y down.
    [[nodiscard]] QRectF toSurface(const Rect &rect) const;
    [[nodiscard]] Rect fromSurface(const QRectF &rect) const;

private:
    struct Subview
    {
        View *view = nullptr;
        std::shared_ptr<View> strong; // empty for what a scene built
    };

    void detachFrom(View &superview);
    void restack();
    void resignInside();
    void forgetInside();
    [[nodiscard]] Point toWindow(Point point) const;
    [[nodiscard]] Point fromWindow(Point point) const;

    QWidget &m_widget;
    const std::int64_t m_hash;
    Rect m_frame;
    View *m_superview = nullptr;
    WeakReference<NextResponder> m_nextResponder;
    std::vector<Subview> m_subviews;
    bool m_isHidden = false;
    bool m_isAboveSiblings = false;
    bool m_wantsLayer = false;
    Layer m_layer;
    std::optional<Cursor> m_cursor;
    std::vector<PanGestureRecognizer *> m_gestureRecognizers;
};

/// Makes a view that is held by reference: it is deleted from the event loop after the last
/// reference is gone, so that it may drop that reference while it handles an event.
template <class ViewClass, class... Arguments>
std::shared_ptr<ViewClass> makeView(Arguments &&...arguments)
{
    return std::shared_ptr<ViewClass>(
        new ViewClass(std::forward<Arguments>(arguments)...), [](ViewClass *view) {
            view->widget().hide();
            view->deleteLater();
        });
}

} // namespace penwick::platform
