// SPDX-License-Identifier: MIT
// A canvas in a window on which random things are done, and a plain repaint to hold it against.
#pragma once

#include <penwick/platform/Geometry.h>
#include <penwick/platform/Window.h>

#include <QEvent>
#include <QImage>

#include <cstdint>
#include <random>
#include <string>

class QString;

namespace penwick {

class DrawViewController;
class DrawingCanvasView;

namespace test {

/// One drawing, made by a pointer, the tools and a window that changes its size. What is done
/// depends on the seed alone.
class PaintSession
{
public:
    explicit PaintSession(std::uint32_t seed);
    ~PaintSession();

    /// One step: a press, a drag, a release, a click of a tool, another size. Gives its name.
    std::string doSomething();

    /// What the window has on the screen.
    [[nodiscard]] QImage onScreen();
    /// Every stroke on the window's paper, oldest first, with nothing kept from before. Text boxes
    /// are blanked out, as they are in withoutTextBoxes().
    [[nodiscard]] QImage paintedAnew() const;
    [[nodiscard]] QImage withoutTextBoxes(QImage picture) const;
    /// The window's picture of its content, text boxes blanked out.
    [[nodiscard]] QImage content() const;
    /// The window painted anew by itself, text boxes included.
    [[nodiscard]] QImage paintedByWindow();

private:
    [[nodiscard]] int anyFrom(int first, int last);
    template <class T>
    T oneOf(std::initializer_list<T> choices);
    [[nodiscard]] double anyCoordinate(double length);
    [[nodiscard]] platform::Point anyPoint();
    [[nodiscard]] platform::Point nextPoint();
    void choose(const QString &tool);
    std::string press();
    std::string drag();
    std::string release();
    std::string chooseAnything();
    std::string changePen();
    std::string resize();
    void send(QEvent::Type type, Qt::MouseButton button);

    std::mt19937 m_random;
    bool m_coversWindow; // as on a white board; else as over something else
    platform::Window m_window;
    DrawingCanvasView *m_canvas = nullptr;
    DrawViewController *m_controller = nullptr;
    platform::Point m_pointer;
    bool m_isPressed = false;
    QRgb m_paper = 0;
};

} // namespace test
} // namespace penwick
