// SPDX-License-Identifier: MIT
// Looks of a tool bar button: by state, by contrast setting and by identifier.
#include "appearance/Theme.h"
#include "toolpanel/ButtonLook.h"
#include "toolpanel/ContrastSetting.h"

#include <gtest/gtest.h>

#include <QApplication>

namespace penwick::test {

namespace {

const QColor normal { 246, 248, 250 };
const QColor hovered { 18, 168, 241 };
const QColor hoveredContrast { 7, 69, 149 };

class ButtonFixture
{
protected:
    explicit ButtonFixture(const QString &identifier = QStringLiteral("eraser"))
        : m_button(platform::Rect { 0, 0, 32, 32 })
    {
        m_button.setIdentifier(identifier);
        m_button.setImage(iconOf(Qt::black));
        m_button.setAlternateImage(iconOf(Qt::white));
        m_button.awakeFromScene();
    }

    void enter() { m_button.mouseEntered(); }
    void leave() { m_button.mouseExited(); }
    void toggle(bool isSelected)
    {
        m_button.setIsSelected(isSelected);
        m_button.toggleToolState();
    }
    [[nodiscard]] ButtonLook look() const { return lookOf(m_button); }

    ContrastSetting m_contrast;
    ToolPanelButton m_button;
};

class ToolPanelButtonTest : public ButtonFixture, public testing::Test
{ };

/// One with colours of its own.
class Violet final : public ToolPanelButton
{
public:
    using ToolPanelButton::ToolPanelButton;
    [[nodiscard]] QColor hoverBackgroundColor() const override { return { 90, 0, 160 }; }
    [[nodiscard]] QColor originalBackgroundColor() const override { return { 240, 230, 250 }; }
};

class ColorButton : public ButtonFixture, public testing::Test
{
protected:
    ColorButton()
        : ButtonFixture(QStringLiteral("color"))
    { }
};

class EndButton : public ButtonFixture, public testing::Test
{
protected:
    EndButton()
        : ButtonFixture(QStringLiteral("state"))
    { }
};

class ButtonWithOptions : public ButtonFixture, public testing::TestWithParam<const char *>
{
protected:
    ButtonWithOptions()
        : ButtonFixture(QLatin1String(GetParam()))
    {
        m_button.setImage({});
        m_button.setAlternateImage({});
        m_button.awakeFromScene();
        m_button.setBackgroundColor(normal);
    }
};

class ButtonWithoutOptions : public ButtonWithOptions
{ };

std::string identifierName(const testing::TestParamInfo<const char *> &identifier)
{
    return *identifier.param ? identifier.param : "none";
}

} // namespace

TEST_F(ToolPanelButtonTest, newOneIsNormal)
{
    const ToolPanelButton button(platform::Rect { 1, 2, 30, 20 });

    EXPECT_FALSE(button.isSelected());
    EXPECT_EQ(button.arrowNormalColor(), QColor(86, 98, 113));
    EXPECT_EQ(button.arrowHoverColor(), QColor(255, 255, 255));
    EXPECT_EQ(button.setArrowColor(), QColor(86, 98, 113));
    EXPECT_EQ(button.hoverBackgroundColor(), TnhColors::toolPanelButtonHoverColor);
    EXPECT_EQ(button.hoverBackgroundColorContrast(), TnhColors::toolPanelButtonHoverColorContrast);
    EXPECT_EQ(button.originalBackgroundColor(), TnhColors::toolPanelButtonColor);
    EXPECT_EQ(button.frame(), (platform::Rect { 1, 2, 30, 20 }));
    EXPECT_TRUE(button.isFlipped());
}

TEST_F(ToolPanelButtonTest, imagesAreTheScenes)
{
    EXPECT_EQ(m_button.buttonImage().cacheKey(), m_button.image().cacheKey());
    EXPECT_EQ(m_button.buttonAltImage().cacheKey(), m_button.alternateImage().cacheKey());
}

TEST_F(ToolPanelButtonTest, imagesAreSet)
{
    const QIcon one(QPixmap(1, 1));
    const QIcon other(QPixmap(2, 2));

    m_button.setButtonImage(one);
    m_button.setButtonAltImage(other);

    EXPECT_EQ(m_button.buttonImage().cacheKey(), one.cacheKey());
    EXPECT_EQ(m_button.buttonAltImage().cacheKey(), other.cacheKey());
}

TEST_F(ToolPanelButtonTest, pointerShowsTheHoverLookAndTakesItAlong)
{
    enter();
    EXPECT_EQ(look(), (ButtonLook { hovered, Shown::AlternateImage, whiteTriangle }));

    leave();
    EXPECT_EQ(look(), (ButtonLook { normal, Shown::Image, normalTriangle }));
}

TEST_F(ToolPanelButtonTest, increasedContrastHasAHoverLookOfItsOwn)
{
    m_contrast.setIncreased(true);

    enter();
    EXPECT_EQ(look(), (ButtonLook { hoveredContrast, Shown::AlternateImage, whiteTriangle }));
    leave();
    EXPECT_EQ(look(), (ButtonLook { normal, Shown::Image, normalTriangle }));
}

TEST_F(ToolPanelButtonTest, selectionAloneChangesNothing)
{
    leave();

    m_button.setIsSelected(true);

    EXPECT_EQ(look(), (ButtonLook { normal, Shown::Image, normalTriangle }));
}

TEST_F(ToolPanelButtonTest, selectedLooksAsHovered)
{
    toggle(true);
    EXPECT_EQ(look(), (ButtonLook { hovered, Shown::AlternateImage, whiteTriangle }));

    toggle(false);
    EXPECT_EQ(look(), (ButtonLook { normal, Shown::Image, normalTriangle }));
}

TEST_F(ToolPanelButtonTest, selectedInIncreasedContrastLooksAsHoveredThere)
{
    m_contrast.setIncreased(true);

    toggle(true);
    EXPECT_EQ(look(), (ButtonLook { hoveredContrast, Shown::AlternateImage, whiteTriangle }));
    toggle(false);
    EXPECT_EQ(look(), (ButtonLook { normal, Shown::Image, normalTriangle }));
}

TEST_F(ToolPanelButtonTest, selectedOneKeepsItsLookWhenThePointerLeaves)
{
    toggle(true);
    enter();

    leave();

    EXPECT_EQ(look(), (ButtonLook { hovered, Shown::AlternateImage, whiteTriangle }));
}

TEST_F(ToolPanelButtonTest, disabledOneDoesNotChangeUnderThePointer)
{
    toggle(false);
    m_button.setEnabled(false);

    enter();

    EXPECT_EQ(look(), (ButtonLook { normal, Shown::Image, normalTriangle }));
}

TEST_F(ToolPanelButtonTest, oneThatWasDisabledUnderThePointerIsNormalAfterIt)
{
    enter();
    m_button.setEnabled(false);

    leave();

    EXPECT_EQ(look(), (ButtonLook { normal, Shown::Image, normalTriangle }));
}

TEST_F(ToolPanelButtonTest, realPointersComingAndGoingAreHeard)
{
    QEnterEvent enterEvent(QPointF(1, 1), QPointF(1, 1), QPointF(1, 1));
    QApplication::sendEvent(&m_button, &enterEvent);
    EXPECT_EQ(m_button.backgroundColor(), hovered);

    QEvent leaveEvent(QEvent::Leave);
    QApplication::sendEvent(&m_button, &leaveEvent);
    EXPECT_EQ(m_button.backgroundColor(), normal);
}

TEST_F(ColorButton, keepsItsImageUnderThePointer)
{
    m_button.setImage(iconOf(Qt::red));
    const qint64 chosen = m_button.image().cacheKey();

    enter();
    EXPECT_EQ(m_button.image().cacheKey(), chosen);
    EXPECT_EQ(m_button.backgroundColor(), hovered);

    leave();
    EXPECT_EQ(m_button.image().cacheKey(), chosen);
    EXPECT_EQ(m_button.backgroundColor(), normal);
}

TEST_F(ColorButton, keepsItsImageWhenToggled)
{
    m_button.setImage(iconOf(Qt::red));
    const qint64 chosen = m_button.image().cacheKey();

    toggle(true);
    EXPECT_EQ(m_button.image().cacheKey(), chosen);
    EXPECT_EQ(m_button.backgroundColor(), hovered);

    toggle(false);
    EXPECT_EQ(m_button.image().cacheKey(), chosen);
    EXPECT_EQ(m_button.backgroundColor(), normal);
}

TEST_F(EndButton, isRedderUnderThePointer)
{
    enter();
    EXPECT_EQ(look(), (ButtonLook { { 255, 80, 134 }, Shown::AlternateImage, whiteTriangle }));

    leave();
    EXPECT_EQ(look(), (ButtonLook { { 239, 71, 111 }, Shown::Image, normalTriangle }));
}

TEST_F(EndButton, isDarkerInIncreasedContrast)
{
    m_contrast.setIncreased(true);

    enter();
    EXPECT_EQ(look(), (ButtonLook { { 219, 47, 87 }, Shown::AlternateImage, whiteTriangle }));
    leave();
    EXPECT_EQ(look(), (ButtonLook { { 190, 41, 76 }, Shown::Image, normalTriangle }));
}

TEST_F(EndButton, takesTheOrdinaryColoursWhenToggled)
{
    toggle(true);
    EXPECT_EQ(look(), (ButtonLook { hovered, Shown::AlternateImage, whiteTriangle }));
    toggle(false);
    EXPECT_EQ(look(), (ButtonLook { normal, Shown::Image, normalTriangle }));

    m_contrast.setIncreased(true);
    toggle(true);
    EXPECT_EQ(look(), (ButtonLook { hoveredContrast, Shown::AlternateImage, whiteTriangle }));
}

// The corners are (30, 30), (30, 24) and (24, 30): pixels right of the slope are wholly covered,
// those on it by half.
TEST_P(ButtonWithOptions, hasATriangleInItsLowerRightCorner)
{
    m_button.assignArrowColor(Qt::black);

    const QImage picture = paintedBy(m_button);

    for (int y = 0; y < 32; ++y) {
        for (int x = 0; x < 32; ++x) {
            const int level = qGreen(picture.pixel(x, y));
            const bool isInside = x < 30 && y < 30;
            if (isInside && x + y >= 54)
                EXPECT_EQ(level, 0) << x << ", " << y;
            else if (isInside && x + y == 53)
                EXPECT_NEAR(level, normal.green() / 2.0, 2) << x << ", " << y;
            else
                EXPECT_EQ(level, normal.green()) << x << ", " << y;
        }
    }
}

TEST_P(ButtonWithOptions, triangleIsWhiteUnderThePointerAndGreyAfterIt)
{
    enter();
    EXPECT_EQ(paintedBy(m_button).pixelColor(28, 28), whiteTriangle);

    leave();
    EXPECT_EQ(paintedBy(m_button).pixelColor(28, 28), normalTriangle);
}

INSTANTIATE_TEST_SUITE_P(
    Identifiers, ButtonWithOptions, testing::Values("text", "brush"), identifierName);

TEST_P(ButtonWithoutOptions, hasNoTriangle)
{
    const QImage picture = paintedBy(m_button);

    for (int y = 0; y < 32; ++y) {
        for (int x = 0; x < 32; ++x)
            EXPECT_EQ(picture.pixelColor(x, y), normal) << x << ", " << y;
    }
}

INSTANTIATE_TEST_SUITE_P(Identifiers, ButtonWithoutOptions,
    testing::Values("eraser", "color", "clear", "state", "undo", "redo", "Text", ""),
    identifierName);

TEST_F(ToolPanelButtonTest, backgroundsAreAssigned)
{
    m_button.setOriginalBackgroundColor(Qt::green);
    m_button.setHoverBackgroundColor(Qt::yellow);
    m_button.setHoverBackgroundColorContrast(Qt::cyan);

    toggle(false);
    EXPECT_EQ(m_button.backgroundColor(), QColor(Qt::green));
    enter();
    EXPECT_EQ(m_button.backgroundColor(), QColor(Qt::yellow));
    leave();
    EXPECT_EQ(m_button.backgroundColor(), QColor(Qt::green));
    m_contrast.setIncreased(true);
    toggle(true);
    EXPECT_EQ(m_button.backgroundColor(), QColor(Qt::cyan));
}

TEST_F(ToolPanelButtonTest, overriddenBackgroundsComeBeforeAssignedOnes)
{
    Violet violet(platform::Rect { 0, 0, 32, 32 });
    violet.setOriginalBackgroundColor(Qt::green);
    violet.setHoverBackgroundColor(Qt::yellow);

    violet.toggleToolState();
    EXPECT_EQ(violet.backgroundColor(), QColor(240, 230, 250));
    violet.mouseEntered();
    EXPECT_EQ(violet.backgroundColor(), QColor(90, 0, 160));
}

TEST_F(ToolPanelButtonTest, trackingAreaIsItsBoundsWhenItWasMade)
{
    ASSERT_TRUE(m_button.trackingArea());
    EXPECT_EQ(m_button.trackingArea()->rect, (platform::Rect { 0, 0, 32, 32 }));
    EXPECT_EQ(m_button.trackingArea()->options, 0x81U);

    m_button.setFrame({ 0, 0, 64, 64 });
    EXPECT_EQ(m_button.trackingArea()->rect, (platform::Rect { 0, 0, 32, 32 }));
    m_button.setTrackingArea(std::nullopt);
    EXPECT_EQ(m_button.trackingArea(), std::nullopt);
}

TEST_F(ToolPanelButtonTest, operationsForThoseThatDeriveChangeNothing)
{
    const ButtonLook before = look();

    m_button.setViewImages();
    m_button.defineTrackingAreaForTextBox();

    EXPECT_EQ(look(), before);
    EXPECT_EQ(m_button.trackingArea()->rect, (platform::Rect { 0, 0, 32, 32 }));
}

} // namespace penwick::test
