// SPDX-License-Identifier: MIT
// Makes a view of any widget class: Qt's events go in, the view's operations come out.
#pragma once

#include "platform/view/OwnLook.h"
#include "platform/view/PanGestureRecognizer.h"
#include "platform/view/PointerContact.h"
#include "platform/view/PointerPress.h"
#include "platform/view/View.h"

#include <QAbstractScrollArea>
#include <QKeyEvent>
#include <QMouseEvent>
#include <QPaintEvent>
#include <QPainter>
#include <QTabletEvent>

#include <type_traits>

namespace penwick::platform {

/// `Base` as a view. An operation that a class does not override does what `Base` does; a plain
/// widget hands the event on to the view around it.
///
/// Only the left button counts as the pointer. Presses of the others are taken and ignored, so that
/// a press of the wheel in the middle of a stroke neither draws nor reaches what lies below.
template <class Base>
class ViewOf : public Base, public View
{
public:
    // The widget has functions of these names too; here they are the view's.
    using View::isHidden;
    using View::setHidden;
    using View::window;

    explicit ViewOf(QWidget *parent = nullptr)
        : Base(parent)
        , View(static_cast<QWidget &>(*this))
    {
        this->setFocusPolicy(Qt::NoFocus); // only makeFirstResponder() moves the focus
        surface().setMouseTracking(true);
    }

    ~ViewOf() override { forgetPress(); }

    [[nodiscard]] QWidget &surface() const final
    {
        if constexpr (scrolls)
            return *this->viewport();
        else
            return this->View::widget();
    }

    void draw(const Rect &) override { Base::paintEvent(m_paintEvent); }
    void mouseDown(const MouseEvent &) override
    {
        if (m_mouseEvent->type() == QEvent::MouseButtonDblClick)
            Base::mouseDoubleClickEvent(m_mouseEvent);
        else
            Base::mousePressEvent(m_mouseEvent);
    }
    void mouseDragged(const MouseEvent &) override { Base::mouseMoveEvent(m_mouseEvent); }
    void mouseUp(const MouseEvent &) override { Base::mouseReleaseEvent(m_mouseEvent); }
    void mouseMoved(const MouseEvent &) override { Base::mouseMoveEvent(m_mouseEvent); }
    void keyUp(const KeyEvent &) override { Base::keyReleaseEvent(m_keyEvent); }

protected:
    /// A painter on the view in the view's own coordinates, with smooth edges. Only inside draw().
    class Painter : public QPainter
    {
    public:
        explicit Painter(const ViewOf &view)
            : QPainter(&view.surface())
        {
            setRenderHint(QPainter::Antialiasing);
            if (!view.isFlipped()) {
                translate(0.0, view.View::widget().height());
                scale(1.0, -1.0);
            }
        }
    };

    bool event(QEvent *event) override
    {
        // Outside of its viewport a scrolling widget would paint nothing but a style's frame.
        if (scrolls && event->type() == QEvent::Paint)
            return true;
        if (event->type() == QEvent::KeyPress)
            keyIsComing();
        const bool changesLook = isAboutLook(*event);
        const bool isHandled = Base::event(event);
        if (!changesLook) // any other event may have destroyed the view
            return isHandled;
        if (keepOwnLook(this->View::widget()))
            place();
        if constexpr (scrolls)
            fillWithSurface();
        return isHandled;
    }

    // Overrides the operation of a `Base` that scrolls.
    bool viewportEvent(QEvent *event)
    {
        if constexpr (scrolls) {
            if (isAboutLook(*event) && keepOwnLook(surface()))
                fillWithSurface();
            return Base::viewportEvent(event);
        }
        return false;
    }

    void paintEvent(QPaintEvent *event) override
    {
        Layer *const ownLayer = layer();
        const QRectF area(surface().rect());
        const QRect dirty = event->region().boundingRect();
        if (ownLayer && ownLayer->hasBackground()) {
            QPainter painter(&surface());
            ownLayer->paintBackground(painter, area);
        }
        m_paintEvent = event;
        draw(fromSurface(dirty));
        m_paintEvent = nullptr;
        if (ownLayer && ownLayer->hasBorderIn(dirty, area)) {
            QPainter painter(&surface());
            ownLayer->paintBorder(painter, area);
        }
    }

    void mousePressEvent(QMouseEvent *event) override
    {
        // A `Base` that does not handle double clicks calls this function for one, from
        // mouseDown().
        if (event == m_mouseEvent)
            Base::mousePressEvent(event);
        else
            press(event, 1);
    }
    void mouseDoubleClickEvent(QMouseEvent *event) override { press(event, 2); }

    void mouseMoveEvent(QMouseEvent *event) override
    {
        event->accept();
        m_mouseEvent = event;
        if (event->buttons() == Qt::NoButton && m_contact.isBeliedBy(*event))
            forgetPress();
        if (event->buttons() == Qt::NoButton)
            mouseMoved(translated(event, 0));
        else if (m_contact.isContinuedBy(*event) && event->buttons().testFlag(Qt::LeftButton))
            drag(translated(event, m_contact.clickCount()));
        m_mouseEvent = nullptr;
    }

    void mouseReleaseEvent(QMouseEvent *event) override
    {
        event->accept();
        if (event->button() != Qt::LeftButton || !m_contact.isContinuedBy(*event))
            return;
        m_mouseEvent = event;
        endContact(translated(event, m_contact.clickCount()));
        m_mouseEvent = nullptr;
    }

    // A pen's events that are not taken come again as a mouse's.
    void tabletEvent(QTabletEvent *event) override
    {
        if (!takesPens())
            return Base::tabletEvent(event);
        if (event->type() == QEvent::TabletPress)
            event->setAccepted(pressPen(*event));
        else
            event->setAccepted(followPen(*event));
    }

    // A view that leaves the screen under the pointer hears of no release.
    void hideEvent(QHideEvent *event) override
    {
        Base::hideEvent(event);
        forgetPress();
    }

    void enterEvent(QEnterEvent *event) override
    {
        Base::enterEvent(event);
        pointerEntered();
        mouseEntered();
    }

    void leaveEvent(QEvent *event) override
    {
        Base::leaveEvent(event);
        mouseExited();
    }

    void keyPressEvent(QKeyEvent *event) override
    {
        m_keyOfChord = isOfChord(*event) ? event->key() : 0;
        Base::keyPressEvent(event);
    }

    void keyReleaseEvent(QKeyEvent *event) override
    {
        if (event->isAutoRepeat()) // the key is still down
            return;
        // When keys held together are let go, the modifiers may be let go first. So the press
        // decides whether the key was alone.
        const bool isErasing = (event->key() == Qt::Key_Backspace || event->key() == Qt::Key_Delete)
            && !isOfChord(*event) && event->key() != m_keyOfChord;
        m_keyEvent = event;
        keyUp({ isErasing ? KeyEvent::backspaceKeyCode : 0 });
        m_keyEvent = nullptr;
    }

    // A plain widget would paint itself again whenever it gets or loses the focus.
    void focusInEvent(QFocusEvent *event) override
    {
        if constexpr (!std::is_same_v<Base, QWidget>)
            Base::focusInEvent(event);
    }

    void focusOutEvent(QFocusEvent *event) override
    {
        if constexpr (!std::is_same_v<Base, QWidget>)
            Base::focusOutEvent(event);
    }

    void resizeEvent(QResizeEvent *event) override
    {
        Base::resizeEvent(event);
        const QSizeF former(event->oldSize());
        widgetResized({ former.width(), former.height() });
    }

private:
    static bool isOfChord(const QKeyEvent &event)
    {
        return event.modifiers() & ~Qt::KeypadModifier;
    }

    static constexpr bool scrolls = std::is_base_of_v<QAbstractScrollArea, Base>;

    // A style may put a frame and padding around the viewport. Margins below zero take that room
    // back, and stay when the widget is laid out again.
    void fillWithSurface()
    {
        const QRect whole = this->View::widget().rect();
        const QRect inside = this->contentsRect();
        const QMargins margins(-inside.left(), -inside.top(), inside.right() - whole.right(),
            inside.bottom() - whole.bottom());
        if (this->viewportMargins() != margins)
            this->setViewportMargins(margins);
    }

    void press(QMouseEvent *event, int clickCount)
    {
        event->accept();
        if (event->button() != Qt::LeftButton || m_contact.excludes(*event))
            return;
        m_mouseEvent = event;
        beginContact(*event, translated(event, clickCount));
        m_mouseEvent = nullptr;
    }

    bool pressPen(const QTabletEvent &event)
    {
        if (m_contact.excludes(event))
            return true; // otherwise it would come again, as a mouse's press
        const bool isOnSubview = surface().childAt(event.position().toPoint());
        if (isOnSubview || !mayTakePress(event))
            return false;
        beginContact(event, translated(&event, 1));
        return true;
    }

    bool followPen(const QTabletEvent &event)
    {
        if (!m_contact.isContinuedBy(event))
            return false;
        const MouseEvent translatedEvent = translated(&event, m_contact.clickCount());
        if (event.type() == QEvent::TabletRelease && event.button() == Qt::LeftButton)
            endContact(translatedEvent);
        else if (event.buttons().testFlag(Qt::LeftButton))
            drag(translatedEvent);
        return true;
    }

    void beginContact(const QPointerEvent &event, const MouseEvent &press)
    {
        m_contact.begin(event, press.locationInWindow, press.clickCount);
        pressIsComing();
        pointerWasPressed();
        mouseDown(press);
        for (PanGestureRecognizer *const recognizer : gestureRecognizers())
            recognizer->pressed(press.locationInWindow);
    }

    void endContact(const MouseEvent &release)
    {
        m_contact.end();
        for (PanGestureRecognizer *const recognizer : gestureRecognizers())
            recognizer->released(release.locationInWindow);
        mouseUp(release);
        pointerWasReleased();
    }

    void forgetPress()
    {
        if (m_contact.end())
            pointerWasReleased();
    }

    void drag(const MouseEvent &event)
    {
        if (m_contact.isDrag(event.locationInWindow, dragDistance()))
            mouseDragged(event);
        for (PanGestureRecognizer *const recognizer : gestureRecognizers())
            recognizer->dragged(event.locationInWindow);
    }

    [[nodiscard]] MouseEvent translated(const QSinglePointEvent *event, int clickCount) const
    {
        const QPointF position = event->position();
        return { locationInWindow(position.x(), position.y()), clickCount, penEndOf(*event) };
    }

    // The event being handled, for the operations that a class leaves to Base.
    QPaintEvent *m_paintEvent = nullptr;
    QMouseEvent *m_mouseEvent = nullptr;
    QKeyEvent *m_keyEvent = nullptr;
    PointerContact m_contact;
    int m_keyOfChord = 0; // the key that was pressed last, if a modifier was held with it
};

} // namespace penwick::platform
