// SPDX-License-Identifier: MIT
// A host whose translators have longer words: what stands on a button stays inside it, and the
// banner grows.
#include "session/SessionFixture.h"

#include "platform/window/WindowContent.h"
#include "session/BannerLabel.h"
#include "session/ToolPanelWindowController.h"
#include "toolpanel/ToolPanelButton.h"
#include "toolpanel/ToolPanelViewController.h"

#include <QApplication>
#include <QTranslator>

#include <map>

namespace penwick::test {

namespace {

/// Has a word for some of the component's.
class Words final : public QTranslator
{
public:
    explicit Words(std::map<std::string, QString> words)
        : m_words(std::move(words))
    {
        QCoreApplication::installTranslator(this);
    }
    ~Words() override { QCoreApplication::removeTranslator(this); }

    [[nodiscard]] bool isEmpty() const override { return false; }
    [[nodiscard]] QString translate(
        const char *, const char *source, const char *, int) const override
    {
        const auto found = m_words.find(source);
        return found == m_words.end() ? QString() : found->second;
    }

private:
    std::map<std::string, QString> m_words;
};

class HostWords : public SessionFixture
{
protected:
    void open()
    {
        m_board = m_penwick.createDrawingWindowController(WindowType::whiteboard, primary());
        m_board->showWindow(nullptr);
        QCoreApplication::processEvents();
    }

    [[nodiscard]] ToolPanelButton &end() const
    {
        return *m_board->tPanelWindowController()->content().button(QStringLiteral("state"));
    }

    /// The columns of the end button that its white title reaches.
    [[nodiscard]] std::pair<int, int> inked() const
    {
        const QImage image = end().grab().toImage();
        int first = image.width();
        int last = -1;
        for (int x = 0; x < image.width(); ++x) {
            for (int y = 3; y < image.height() - 3; ++y) { // not its round corners
                if (image.pixelColor(x, y).green() > 150) {
                    first = std::min(first, x);
                    last = x;
                }
            }
        }
        return { first, last };
    }

    [[nodiscard]] BannerLabel &bannerLabel() const
    {
        return *m_board->sharingNotificationWindow()->findChild<BannerLabel *>();
    }

    Penwick m_penwick;
    std::shared_ptr<DrawingWindowController> m_board;
};

} // namespace

TEST_F(HostWords, shortTitleStandsOnItsButtonAsItIs)
{
    open();

    EXPECT_EQ(end().toolTip(), QStringLiteral("End"));
    EXPECT_GE(inked().first, 2);
    EXPECT_LE(inked().second, end().width() - 3);
}

TEST_F(HostWords, longerTitleShrinksInsideItsButtonAndIsItsToolTip)
{
    const Words words({ { "END", QStringLiteral("FINIR!") } });

    open();

    EXPECT_EQ(end().toolTip(), QStringLiteral("FINIR!"));
    EXPECT_GE(inked().first, 1);
    EXPECT_LE(inked().second, end().width() - 2);
    EXPECT_LT(inked().first, inked().second);
}

TEST_F(HostWords, muchLongerTitleIsShortenedInsideItsButton)
{
    const QString longTitle = QStringLiteral("ZEICHENSITZUNG BEENDEN");
    const Words words({ { "END", longTitle } });

    open();

    EXPECT_EQ(end().toolTip(), longTitle);
    EXPECT_EQ(end().attributedTitle().string, longTitle);
    EXPECT_GE(inked().first, 1);
    EXPECT_LE(inked().second, end().width() - 2);
    EXPECT_GT(inked().second - inked().first, 20);
}

TEST_F(HostWords, bannerIsAsUsualForAShortText)
{
    open();

    EXPECT_EQ(m_board->sharingNotificationWindow()->frame().size(), (platform::Size { 300, 60 }));
}

TEST_F(HostWords, bannerGrowsForALongerText)
{
    const Words words({ { "This drawing is being shared",
        QStringLiteral("Diese Zeichnung wird gerade mit allen Teilnehmern geteilt") } });

    open();

    const platform::Window &banner = *m_board->sharingNotificationWindow();
    EXPECT_GT(banner.frame().width, 400);
    EXPECT_EQ(banner.frame().height, 60);
    EXPECT_EQ(contentOf(banner).contentView()->frame().width, banner.frame().width);
    EXPECT_GE(bannerLabel().width(), bannerLabel().widthOfText());
    EXPECT_LT(bannerLabel().width(), bannerLabel().widthOfText() + 1);
    EXPECT_EQ(banner.frame().width - bannerLabel().width(), 16);
}

TEST_F(HostWords, bannerIsNoWiderThanTheScreen)
{
    const Words words({ { "This drawing is being shared", QString(400, QLatin1Char('W')) } });

    open();
    m_board->showSharingNotificationWindow();

    EXPECT_EQ(m_board->sharingNotificationWindow()->frame().width, 1920 - 40);
    EXPECT_EQ(bannerLabel().accessibleName(), QString(400, QLatin1Char('W')));
}

} // namespace penwick::test
