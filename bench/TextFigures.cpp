// SPDX-License-Identifier: MIT
// What a large clipboard costs a text box, and every event after it.
#include "Board.h"
#include "Figure.h"

#include "appearance/PenwickBundle.h"
#include "platform/view/ViewOf.h"
#include "platform/window/WindowContent.h"
#include "textbox/TnTextBox.h"

#include <penwick/platform/Window.h>

#include <QClipboard>
#include <QCoreApplication>
#include <QGuiApplication>
#include <QKeyEvent>

#include <functional>
#include <utility>

namespace penwick::bench {

namespace {

constexpr int rounds = 7;
constexpr double frameOfTheHost = 16'000.0; // microseconds

class Paper final : public platform::ViewOf<QWidget>
{
public:
    using ViewOf::ViewOf;
};

class Owner final : public QObject, public TextBoxDelegate
{
public:
    void shouldDeleteTheTextBox(std::int64_t) override { }
};

void pressKey(QWidget &box, int key, Qt::KeyboardModifiers modifiers, const QString &text)
{
    for (const QEvent::Type type : { QEvent::KeyPress, QEvent::KeyRelease }) {
        QKeyEvent event(type, key, modifiers, text);
        QCoreApplication::sendEvent(&box, &event);
    }
}

/// A box that is being edited on paper of 1280 by 720 points.
class Writing
{
public:
    explicit Writing(platform::Point corner)
        : m_paper(new Paper(&m_window))
        , m_box(TnTextBox::create({ corner.x, corner.y, 200, 30 }, 24.0, Qt::black))
    {
        m_paper->setWantsLayer(true);
        contentOf(m_window).adoptScene();
        contentOf(m_window).setContentView(m_paper);
        m_window.resize(1280, 720);
        m_window.show();
        m_window.activateWindow();
        m_box->setTextBoxDelegate(&m_owner);
        m_paper->addSubview(m_box);
        contentOf(m_window).makeFirstResponder(m_box.get());
        settle();
    }

    TnTextBox &box() { return *m_box; }
    void end() { contentOf(m_window).makeFirstResponder(m_paper); }

private:
    Owner m_owner;
    platform::Window m_window;
    Paper *m_paper; // the window's
    std::shared_ptr<TnTextBox> m_box;
};

using Event = std::function<void(Writing &)>;

const std::vector<std::pair<const char *, Event>> &events()
{
    static const std::vector<std::pair<const char *, Event>> all {
        { "paste", [](Writing &writing) { writing.box().paste(); } },
        { "letter that does not fit",
            [](Writing &writing) { pressKey(writing.box(), Qt::Key_A, {}, QStringLiteral("a")); } },
        { "Backspace",
            [](Writing &writing) { pressKey(writing.box(), Qt::Key_Backspace, {}, {}); } },
        { "letter",
            [](Writing &writing) { pressKey(writing.box(), Qt::Key_A, {}, QStringLiteral("a")); } },
        { "Select All",
            [](Writing &writing) { pressKey(writing.box(), Qt::Key_A, Qt::ControlModifier, {}); } },
        { "Delete of all",
            [](Writing &writing) { pressKey(writing.box(), Qt::Key_Delete, {}, {}); } },
        { "undo of it",
            [](Writing &writing) { pressKey(writing.box(), Qt::Key_Z, Qt::ControlModifier, {}); } },
        { "end of the edit", [](Writing &writing) { writing.end(); } },
        { "step of a drag",
            [](Writing &writing) {
                writing.box().setFrameOrigin(
                    writing.box().frame().origin() + platform::Point { 5, 5 });
            } },
    };
    return all;
}

Time timeOfEvent(const Event &event, Writing &writing)
{
    const Stopwatch watch;
    event(writing);
    paintMarked();
    return watch.elapsed();
}

void measure(
    const QString &clipboard, const QString &name, platform::Point corner, Figures &figures)
{
    std::vector<Samples> samples(events().size());
    for (int round = 0; round < rounds; ++round) {
        QGuiApplication::clipboard()->setText(clipboard);
        Writing writing(corner);
        for (std::size_t event = 0; event < events().size(); ++event) {
            samples[event].add(timeOfEvent(events()[event].second, writing));
            settle();
        }
    }
    for (std::size_t event = 0; event < events().size(); ++event) {
        figures.push_back(
            timeOf("9 " + std::string(events()[event].first) + ", " + name.toStdString(),
                samples[event], { frameOfTheHost, std::nullopt }));
    }
}

} // namespace

Figures textFigures()
{
    setPenwickBundle(std::make_shared<platform::Bundle>(QStringLiteral(":/penwick/images")));
    constexpr platform::Point middle { 500, 400 };
    constexpr platform::Point lowerRight { 1200, 10 };
    Figures figures;
    for (const int megabytes : { 1, 5 }) {
        const int size = megabytes * 1'000'000;
        const QString of = QStringLiteral(" of %1 MB").arg(megabytes);
        measure(QString(size, QLatin1Char('m')), QStringLiteral("a word") + of, middle, figures);
        measure(QStringLiteral("The quick brown fox\n").repeated(size / 20),
            QStringLiteral("lines") + of, lowerRight, figures);
    }
    // Several writings in one word: what a text of that length costs at most.
    measure(QStringLiteral("a漢mש").repeated(250'000), QStringLiteral("mixed writings"), lowerRight,
        figures);
    return figures;
}

} // namespace penwick::bench
