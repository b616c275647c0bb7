// SPDX-License-Identifier: MIT
// A button: what it does when it is pressed and what it shows.
#include "platform/view/Button.h"

#include "platform/SvgFile.h"
#include "platform/ViewFixture.h"
#include "platform/scene/Bundle.h"
#include "platform/scene/ButtonImages.h"
#include "platform/window/WindowContent.h"

#include <QAccessible>
#include <QPixmap>

namespace penwick::platform {

namespace {

/// A button of 40 x 20 in the content's bottom left corner that counts its presses.
class ButtonTest : public ViewFixture
{
protected:
    ButtonTest()
    {
        m_button->setFrame({ 0.0, 0.0, 40.0, 20.0 });
        m_content.addSubview(m_button);
        m_button->setAction([this](Button &) { ++m_presses; });
    }

    /// An image of 10 x 10 in one colour.
    static QIcon icon(const QColor &color)
    {
        QPixmap pixmap(10, 10);
        pixmap.fill(color);
        return QIcon(pixmap);
    }

    [[nodiscard]] QImage picture() const
    {
        QImage image(40, 20, QImage::Format_RGB32);
        image.fill(Qt::white);
        m_button->QWidget::render(&image, QPoint(), QRegion(), QWidget::RenderFlags());
        return image;
    }

    const std::shared_ptr<Button> m_button = makeView<Button>();
    int m_presses = 0;
};

} // namespace

TEST_F(ButtonTest, clickRunsTheActionOnceWithTheStateOn)
{
    Button::State seen = Button::State::Off;
    m_button->setAction([&](Button &button) {
        ++m_presses;
        seen = button.state();
    });
    EXPECT_EQ(m_button->state(), Button::State::Off);

    QTest::mouseClick(m_button.get(), Qt::LeftButton);

    EXPECT_EQ(m_presses, 1);
    EXPECT_EQ(seen, Button::State::On);
}

TEST_F(ButtonTest, pressAloneRunsNothing)
{
    QTest::mousePress(m_button.get(), Qt::LeftButton);

    EXPECT_EQ(m_presses, 0);
    EXPECT_TRUE(m_button->isDown());
}

TEST_F(ButtonTest, releaseOutsideRunsNothing)
{
    QTest::mousePress(m_button.get(), Qt::LeftButton);
    QTest::mouseRelease(m_button.get(), Qt::LeftButton, Qt::NoModifier, QPoint(60, 10));

    EXPECT_EQ(m_presses, 0);
    EXPECT_FALSE(m_button->isDown());
}

TEST_F(ButtonTest, otherButtonsOfThePointerRunNothing)
{
    QTest::mouseClick(m_button.get(), Qt::RightButton);
    QTest::mouseClick(m_button.get(), Qt::MiddleButton);

    EXPECT_EQ(m_presses, 0);
}

TEST_F(ButtonTest, doubleClickRunsTheActionTwice)
{
    QTest::mouseClick(m_button.get(), Qt::LeftButton);
    QMouseEvent again(QEvent::MouseButtonDblClick, QPointF(20, 10),
        m_button->mapToGlobal(QPointF(20, 10)), Qt::LeftButton, Qt::LeftButton, Qt::NoModifier);
    QCoreApplication::sendEvent(m_button.get(), &again);
    EXPECT_TRUE(m_button->isDown());
    QTest::mouseRelease(m_button.get(), Qt::LeftButton);

    EXPECT_EQ(m_presses, 2);
}

TEST_F(ButtonTest, disabledOneRunsNothing)
{
    m_button->setEnabled(false);

    QTest::mouseClick(m_button.get(), Qt::LeftButton);

    EXPECT_EQ(m_presses, 0);
}

TEST_F(ButtonTest, pressThroughAccessibilityRunsTheAction)
{
    QAccessibleInterface *const accessible = QAccessible::queryAccessibleInterface(m_button.get());

    accessible->actionInterface()->doAction(QAccessibleActionInterface::pressAction());

    EXPECT_TRUE(QTest::qWaitFor([this] { return m_presses == 1; }));
}

TEST_F(ButtonTest, pressThroughAccessibilityWaitsWhileThePointerIsHeldDownElsewhere)
{
    const auto other = added({ 100.0, 0.0, 20.0, 20.0 });
    QTest::mousePress(other.get(), Qt::LeftButton);

    m_button->click();
    EXPECT_EQ(m_presses, 0);

    QTest::mouseRelease(other.get(), Qt::LeftButton);
    EXPECT_EQ(m_presses, 1);
}

TEST_F(ButtonTest, withoutAnActionIsTurnedOnOnly)
{
    m_button->setAction({});

    m_button->click();

    EXPECT_EQ(m_button->state(), Button::State::On);
}

TEST_F(ButtonTest, neverTakesTheKeys)
{
    contentOf(m_window).makeFirstResponder(&m_content);

    QTest::mouseClick(m_button.get(), Qt::LeftButton);

    EXPECT_EQ(contentOf(m_window).firstResponder(), &m_content);
    EXPECT_EQ(m_button->focusPolicy(), Qt::NoFocus);
}

TEST_F(ButtonTest, imageIsInTheMiddleOfTheBackground)
{
    m_button->setBackgroundColor(Qt::yellow);
    m_button->setImage(icon(Qt::red));

    const QImage shown = picture();

    EXPECT_EQ(shown.pixelColor(0, 0), QColor(Qt::yellow));
    EXPECT_EQ(shown.pixelColor(14, 10), QColor(Qt::yellow));
    EXPECT_EQ(shown.pixelColor(15, 5), QColor(Qt::red));
    EXPECT_EQ(shown.pixelColor(24, 14), QColor(Qt::red));
    EXPECT_EQ(shown.pixelColor(25, 10), QColor(Qt::yellow));
    EXPECT_EQ(shown.pixelColor(20, 15), QColor(Qt::yellow));
}

TEST_F(ButtonTest, alternateImageIsShownWhileHeldDown)
{
    m_button->setImage(icon(Qt::red));
    m_button->setAlternateImage(icon(Qt::blue));

    QTest::mousePress(m_button.get(), Qt::LeftButton);
    EXPECT_EQ(picture().pixelColor(20, 10), QColor(Qt::blue));

    QTest::mouseRelease(m_button.get(), Qt::LeftButton);
    EXPECT_EQ(picture().pixelColor(20, 10), QColor(Qt::red));
}

TEST_F(ButtonTest, withoutAnAlternateImageKeepsItsImageWhileHeldDown)
{
    m_button->setImage(icon(Qt::red));

    QTest::mousePress(m_button.get(), Qt::LeftButton);

    EXPECT_EQ(picture().pixelColor(20, 10), QColor(Qt::red));
}

TEST_F(ButtonTest, titleIsShownWhereThereIsNoImageAndReadOut)
{
    AttributedString title;
    title.string = QStringLiteral("END");
    title.foregroundColor = Qt::red;
    title.alignment = Qt::AlignCenter;
    m_button->setAttributedTitle(title);

    EXPECT_EQ(m_button->attributedTitle(), title);
    EXPECT_EQ(m_button->text(), QStringLiteral("END"));
    const QImage shown = picture();
    int inked = 0;
    for (int y = 0; y < shown.height(); ++y) {
        for (int x = 0; x < shown.width(); ++x)
            inked += shown.pixelColor(x, y) != QColor(Qt::white) ? 1 : 0;
    }
    EXPECT_GT(inked, 10);
}

TEST_F(ButtonTest, titleThatIsTooLongIsTheToolTipUntilAShorterOneComes)
{
    AttributedString title;
    title.string = QStringLiteral("A title that no button of this width has room for");
    m_button->setToolTip(QStringLiteral("its own"));

    m_button->setAttributedTitle(title);
    EXPECT_EQ(m_button->toolTip(), title.string);
    title.string += QStringLiteral(", and more of it");
    m_button->setAttributedTitle(title);
    EXPECT_EQ(m_button->toolTip(), title.string);

    title.string = QStringLiteral("I");
    m_button->setAttributedTitle(title);
    EXPECT_EQ(m_button->toolTip(), QStringLiteral("its own"));
}

TEST_F(ButtonTest, backgroundHasTheLayersRoundCorners)
{
    m_button->setWantsLayer(true);
    m_button->layer()->cornerRadius = 8.0;
    m_button->setBackgroundColor(Qt::yellow);

    const QImage shown = picture();

    EXPECT_EQ(shown.pixelColor(0, 0), QColor(Qt::white));
    EXPECT_EQ(shown.pixelColor(20, 0), QColor(Qt::yellow));
}

TEST_F(ButtonTest, showsNothingOfTheDesktopsOwnLook)
{
    QImage paper(40, 20, QImage::Format_RGB32);
    paper.fill(Qt::white);

    EXPECT_EQ(picture(), paper);
    QTest::mousePress(m_button.get(), Qt::LeftButton);
    EXPECT_EQ(picture(), paper);
}

TEST_F(ButtonTest, imagesAreLoadedByTheirNames)
{
    const SvgFile artwork(20, 10); // its left half is red
    m_button->setImageName(QStringLiteral("Artwork"));
    m_button->setAlternateImage(icon(Qt::blue));

    loadImages(*m_button, Bundle(artwork.folder()));

    EXPECT_EQ(picture().pixelColor(15, 10), QColor(Qt::red));
    EXPECT_EQ(picture().pixelColor(25, 10), QColor(Qt::white));
    EXPECT_FALSE(m_button->alternateImage().isNull()); // it has no name and stays
}

TEST_F(ButtonTest, keepsItsIdentifier)
{
    EXPECT_EQ(m_button->identifier(), QString());

    m_button->setProperty("identifier", QStringLiteral("brush"));

    EXPECT_EQ(m_button->identifier(), QStringLiteral("brush"));
}

} // namespace penwick::platform
