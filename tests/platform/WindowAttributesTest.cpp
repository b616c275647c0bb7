// SPDX-License-Identifier: MIT
// A window's attributes: kept as they are set, and what they do to the widget.
#include "platform/WindowFixture.h"

#include "platform/window/WindowFlags.h"

#include <QImage>

namespace penwick::platform {

namespace {

class WindowAttribute : public WindowFixture
{ };

} // namespace

TEST_F(WindowAttribute, newWindowIsAnOrdinaryOne)
{
    const WindowAttributes &attributes = m_window.attributes();

    EXPECT_EQ(attributes.styleMask, 7U);
    EXPECT_EQ(attributes.collectionBehavior, 0U);
    EXPECT_EQ(attributes.level, 0);
    EXPECT_EQ(attributes.sharingType, 1U);
    EXPECT_EQ(attributes.titleVisibility, 0U);
    EXPECT_EQ(attributes.animationBehavior, 0);
    EXPECT_FALSE(attributes.titlebarAppearsTransparent);
    EXPECT_TRUE(attributes.hasShadow);
    EXPECT_TRUE(attributes.isOpaque);
    EXPECT_FALSE(attributes.ignoresMouseEvents);
    EXPECT_EQ(attributes.backgroundColor, QColor(Qt::white));
    EXPECT_EQ(attributes.aspectRatio, std::nullopt);
    EXPECT_EQ(m_window.windowFlags(), windowFlagsFor(attributes));
}

TEST_F(WindowAttribute, everyValueIsKeptAsItWasSet)
{
    WindowAttributes attributes;
    attributes.styleMask = 0xFFF1;
    attributes.collectionBehavior = 257;
    attributes.level = -3;
    attributes.sharingType = 0;
    attributes.titleVisibility = 1;
    attributes.animationBehavior = 5;
    attributes.titlebarAppearsTransparent = true;
    attributes.hasShadow = false;
    attributes.isOpaque = false;
    attributes.ignoresMouseEvents = true;
    attributes.backgroundColor = QColor(1, 2, 3, 4);
    attributes.aspectRatio = Size { 16.0, 9.0 };

    m_window.setAttributes(attributes);

    EXPECT_EQ(m_window.attributes(), attributes);
    EXPECT_EQ(m_window.windowFlags(), windowFlagsFor(attributes));
}

TEST_F(WindowAttribute, styleMaskHasItsRawValues)
{
    EXPECT_EQ(StyleMask::titled, 1U);
    EXPECT_EQ(StyleMask::closable, 2U);
    EXPECT_EQ(StyleMask::miniaturizable, 4U);
    EXPECT_EQ(StyleMask::resizable, 8U);
    EXPECT_EQ(StyleMask::unifiedTitleAndToolbar, 4096U);
    EXPECT_EQ(StyleMask::fullSizeContentView, 32768U);
}

TEST_F(WindowAttribute, windowThatIsNotOpaqueShowsWhatLiesBelow)
{
    WindowAttributes attributes;
    attributes.isOpaque = false;
    attributes.backgroundColor = Qt::transparent;

    m_window.setAttributes(attributes);

    EXPECT_TRUE(m_window.testAttribute(Qt::WA_TranslucentBackground));
    EXPECT_EQ(m_window.grab(QRect(0, 0, 1, 1)).toImage().pixelColor(0, 0).alpha(), 0);
    m_window.setAttributes({});
    EXPECT_FALSE(m_window.testAttribute(Qt::WA_TranslucentBackground));
}

TEST_F(WindowAttribute, backgroundIsPaintedInItsColour)
{
    WindowAttributes attributes;
    attributes.backgroundColor = QColor(10, 20, 30);

    m_window.setAttributes(attributes);

    EXPECT_EQ(m_window.grab(QRect(0, 0, 1, 1)).toImage().pixelColor(0, 0), QColor(10, 20, 30));
}

TEST_F(WindowAttribute, onlyWindowsWithATitleTakeTheKeysWhenTheyAreShown)
{
    EXPECT_FALSE(m_window.testAttribute(Qt::WA_ShowWithoutActivating));
    WindowAttributes borderless;
    borderless.styleMask = 0;

    m_window.setAttributes(borderless);

    EXPECT_TRUE(m_window.testAttribute(Qt::WA_ShowWithoutActivating));
}

TEST_F(WindowAttribute, windowStaysOnTheScreenWhenItsFlagsChange)
{
    show(m_window);
    WindowAttributes attributes;
    attributes.level = mainMenuWindowLevel;

    m_window.setAttributes(attributes);

    EXPECT_TRUE(m_window.isVisible());
    EXPECT_TRUE(m_window.windowFlags().testFlag(Qt::WindowStaysOnTopHint));
    EXPECT_EQ(m_delegate.take(), Log {});
}

TEST_F(WindowAttribute, hiddenWindowStaysHiddenWhenItsFlagsChange)
{
    WindowAttributes attributes;
    attributes.level = mainMenuWindowLevel;

    m_window.setAttributes(attributes);

    EXPECT_FALSE(m_window.isVisible());
}

} // namespace penwick::platform
