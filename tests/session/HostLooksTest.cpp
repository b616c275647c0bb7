// SPDX-License-Identifier: MIT
// A host with looks of its own: tool bar, popovers, text boxes and banner look as in one without,
// picture by picture.
#include "session/SessionFixture.h"

#include "canvas/DrawViewController.h"
#include "canvas/DrawingCanvasModel.h"
#include "canvas/DrawingCanvasView.h"
#include "platform/window/WindowContent.h"
#include "session/ToolPanelWindowController.h"
#include "textbox/TnTextBox.h"
#include "toolpanel/PopoverView.h"
#include "toolpanel/PopoverViewController.h"
#include "toolpanel/ToolPanelButton.h"
#include "toolpanel/ToolPanelViewController.h"

#include <QApplication>
#include <QImage>
#include <QPainter>
#include <QProxyStyle>
#include <QStyleFactory>
#include <QStyleOption>
#include <QTest>

#include <map>
#include <string>
#include <tuple>

namespace penwick::test {

namespace {

/// Paints and sizes whatever it is asked for in its own way.
class LoudStyle final : public QProxyStyle
{
public:
    LoudStyle()
        : QProxyStyle(QStyleFactory::create(QStringLiteral("Windows")))
    { }

    using QProxyStyle::polish;
    void polish(QWidget *widget) override
    {
        widget->setMinimumSize(60, 60);
        widget->setAutoFillBackground(true);
        widget->setAttribute(Qt::WA_StyledBackground);
        QPalette red(Qt::red);
        red.setColor(QPalette::Text, Qt::green);
        red.setColor(QPalette::Highlight, Qt::yellow);
        widget->setPalette(red);
        widget->setFont(QFont(QStringLiteral("DejaVu Serif"), 28));
    }
    int pixelMetric(
        PixelMetric metric, const QStyleOption *option, const QWidget *widget) const override
    {
        return metric == PM_DefaultFrameWidth ? 7
                                              : QProxyStyle::pixelMetric(metric, option, widget);
    }
    void drawPrimitive(PrimitiveElement, const QStyleOption *option, QPainter *painter,
        const QWidget *) const override
    {
        painter->fillRect(option->rect, Qt::red);
    }
    void drawControl(ControlElement, const QStyleOption *option, QPainter *painter,
        const QWidget *) const override
    {
        painter->fillRect(option->rect, Qt::red);
    }
};

/// One look that a host may have, and what sets it.
struct HostLook
{
    const char *name;
    const char *sheet = "";
    const char *style = "";
    int fontSize = 0; // points
    bool isDark = false;
    bool isFromTheRight = false;
};

QPalette darkPalette()
{
    QPalette dark(QColor(34, 34, 34));
    dark.setColor(QPalette::Text, QColor(238, 238, 238));
    dark.setColor(QPalette::Base, QColor(20, 20, 20));
    dark.setColor(QPalette::Highlight, QColor(255, 120, 0));
    return dark;
}

constexpr auto plainDark = "QWidget { background: #222; color: #eee; padding: 6px; "
                           "border: 1px solid #555; font-size: 20px; }";
constexpr auto common
    = "QWidget { background-color: #19232D; color: #DFE1E2; selection-background-color: #346792; }"
      "QPushButton { background-color: #455364; border-radius: 4px; padding: 2px; min-width: 80px; "
      "min-height: 24px; outline: none; }"
      "QPushButton:hover { background-color: #54687A; } QPushButton:disabled { color: #788D9C; }"
      "QTextEdit { background-color: #19232D; border: 1px solid #455364; padding: 8px; "
      "font: italic 22px; } QTextEdit:focus { border: 3px solid #1A72BB; }"
      "QFrame { border-radius: 4px; border: 2px solid #455364; margin: 4px; }"
      "QAbstractScrollArea { padding: 4px; } QToolTip { background: #346792; }";
constexpr auto everything
    = "* { background: black; color: red; border: 5px solid green; padding: 10px; margin: 3px; "
      "min-width: 70px; min-height: 70px; max-width: 90px; font: bold 28pt; }";

class HostLooks : public SessionFixture,
                  public testing::WithParamInterface<std::tuple<HostLook, int>>
{
protected:
    using Pictures = std::map<std::string, QImage>;

    HostLooks()
    {
        QApplication::setCursorFlashTime(0); // a caret that is always there
    }
    ~HostLooks() override { takeOff(); }

    [[nodiscard]] static const HostLook &look() { return std::get<0>(GetParam()); }
    [[nodiscard]] static int scale() { return std::get<1>(GetParam()); }

    static void putOn()
    {
        if (look().isFromTheRight)
            QApplication::setLayoutDirection(Qt::RightToLeft);
        if (look().isDark)
            QApplication::setPalette(darkPalette());
        const QString style = QLatin1String(look().style);
        if (style == QStringLiteral("loud"))
            QApplication::setStyle(new LoudStyle);
        else if (!style.isEmpty())
            QApplication::setStyle(style);
        if (look().fontSize) {
            QFont font(QStringLiteral("DejaVu Serif"), look().fontSize, QFont::Bold, true);
            font.setLetterSpacing(QFont::AbsoluteSpacing, 4);
            QApplication::setFont(font);
        }
        application().setStyleSheet(QLatin1String(look().sheet));
    }

    void takeOff()
    {
        application().setStyleSheet(QString());
        QApplication::setStyle(m_style);
        QApplication::setPalette(m_palette);
        QApplication::setFont(m_font);
        QApplication::setLayoutDirection(Qt::LeftToRight);
    }

    void open()
    {
        m_board = m_penwick->createDrawingWindowController(WindowType::whiteboard, primary());
        m_board->showWindow(nullptr);
        EXPECT_TRUE(QTest::qWaitForWindowActive(m_board->window()));
        QApplication::processEvents();
    }

    void close()
    {
        m_board.reset();
        m_penwick = std::make_unique<Penwick>();
        deleteWhatIsLeft();
    }

    [[nodiscard]] Pictures pictures()
    {
        Pictures all;
        addBar(all);
        addPopovers(all);
        if (!look().isFromTheRight) // there their texts begin at the right
            addBoxes(all);
        m_board->showSharingNotificationWindow();
        all["banner"] = picture(*m_board->sharingNotificationWindow());
        return all;
    }

    void addBar(Pictures &all)
    {
        ToolBarPanelWindow &panel = *m_board->tPanelWindowController()->toolPanelWindow();
        for (const auto *const button : panel.findChildren<platform::Button *>())
            EXPECT_EQ(button->minimumSize(), QSize(0, 0));
        all["bar"] = picture(panel);
    }

    void addPopovers(Pictures &all)
    {
        ToolPanelViewController &bar = m_board->tPanelWindowController()->content();
        const auto press = [&](const char *tool) { bar.button(QLatin1String(tool))->click(); };
        for (const char *const tool : { "brush", "color", "text" }) {
            if (!bar.popoverW()->isVisible())
                press(tool);
            if (!bar.popoverW()->isVisible())
                press(tool);
            QApplication::processEvents();
            all[std::string("popover of ") + tool] = picture(*bar.popoverW());
            bar.hidePopover();
        }
    }

    void addBoxes(Pictures &all)
    {
        auto &drawing = dynamic_cast<DrawViewController &>(
            *contentOf(*m_board->window()).contentViewController());
        DrawingCanvasView &canvas = *drawing.drawingView();
        drawing.handleToolSelection(QStringLiteral("text"));
        QWindow &window = *m_board->window()->windowHandle();
        if (contentOf(*m_board->window()).firstResponder() != &canvas)
            QTest::mouseClick(&window, Qt::LeftButton, {}, { 300, 100 });
        QTest::mouseClick(&window, Qt::LeftButton, {}, { 300, 200 });
        TnTextBox &box = *canvas.textBoxArray().last().textBox;
        QApplication::processEvents();
        all["empty box"] = picture(box);
        for (const Qt::Key letter : { Qt::Key_W, Qt::Key_O, Qt::Key_R, Qt::Key_D })
            QTest::keyClick(&window, letter);
        QApplication::processEvents();
        all["edited box"] = picture(box);
        box.selectAll();
        all["selected words"] = picture(box);
        QTest::keyClick(&window, Qt::Key_Return);
        QApplication::processEvents();
        all["placed box"] = picture(box);
        all["delete button"] = picture(*box.deleteTextButton());
    }

    [[nodiscard]] static QImage picture(QWidget &widget)
    {
        QImage image(widget.size() * scale(), QImage::Format_ARGB32_Premultiplied);
        image.setDevicePixelRatio(scale());
        image.fill(Qt::transparent);
        widget.render(&image, QPoint(), QRegion(), QWidget::DrawChildren);
        return image;
    }

    static void expectEqual(const Pictures &seen, const Pictures &expected)
    {
        ASSERT_EQ(seen.size(), expected.size());
        for (const auto &[name, image] : expected) {
            EXPECT_EQ(seen.at(name).size(), image.size()) << name;
            EXPECT_TRUE(seen.at(name) == image) << name;
            const QString folder = qEnvironmentVariable("PENWICK_KEEP_PICTURES");
            if (!folder.isEmpty() && seen.at(name) != image) {
                const QString file = folder + QLatin1Char('/') + QString::fromStdString(name)
                    + QLatin1Char('-') + QLatin1String(look().name);
                seen.at(name).save(file + QStringLiteral("-seen.png"));
                image.save(file + QStringLiteral("-expected.png"));
            }
        }
    }

    /// As in a host that sets nothing. Taken once.
    [[nodiscard]] const Pictures &usual()
    {
        static std::map<std::pair<int, bool>, Pictures> taken;
        Pictures &all = taken[{ scale(), look().isFromTheRight }];
        if (all.empty()) {
            open();
            all = pictures();
            close();
        }
        return all;
    }

    std::unique_ptr<Penwick> m_penwick = std::make_unique<Penwick>();
    std::shared_ptr<DrawingWindowController> m_board;

private:
    static QApplication &application() { return *qobject_cast<QApplication *>(qApp); }

    const QString m_style = QApplication::style()->name();
    const QPalette m_palette = QApplication::palette();
    const QFont m_font = QApplication::font();
};

std::string lookName(const testing::TestParamInfo<std::tuple<HostLook, int>> &look)
{
    return std::get<0>(look.param).name + std::string("At")
        + std::to_string(std::get<1>(look.param));
}

} // namespace

TEST_P(HostLooks, doNotChangeAWindowThatIsOpenedLater)
{
    const Pictures &expected = usual();

    putOn();
    open();

    expectEqual(pictures(), expected);
    close();
}

TEST_P(HostLooks, doNotChangeAWindowThatIsOpenAlready)
{
    const Pictures &expected = usual();
    open();

    putOn();
    QApplication::processEvents();

    expectEqual(pictures(), expected);
    close();
}

INSTANTIATE_TEST_SUITE_P(All, HostLooks,
    testing::Combine(
        testing::Values(HostLook { "plainDarkSheet", plainDark },
            HostLook { "commonDarkSheet", common }, HostLook { "sheetForEverything", everything },
            HostLook { "darkPalette", "", "", 0, true }, HostLook { "fusion", "", "fusion" },
            HostLook { "windows", "", "windows", 0, true }, HostLook { "ownStyle", "", "loud" },
            HostLook { "ownStyleAndSheet", common, "loud", 28, true },
            HostLook { "largeFont", "", "", 28 }, HostLook { "smallFont", "", "", 6 },
            HostLook { "fromTheRight", plainDark, "", 28, true, true }),
        testing::Values(1, 2)),
    lookName);

} // namespace penwick::test
