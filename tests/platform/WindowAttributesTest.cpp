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

    EXPECT_EQ(attributes.styleMask.toInt(), 7U);
    EXPECT_EQ(attributes.collectionBehavior, CollectionBehaviors());
    EXPECT_EQ(attributes.level, WindowLevel::normal);
    EXPECT_EQ(attributes.sharingType, SharingType::readOnly);
    EXPECT_EQ(attributes.titleVisibility, TitleVisibility::visible);
    EXPECT_EQ(attributes.animationBehavior, AnimationBehavior::byDefault);
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
    attributes.styleMask = StyleMasks::fromInt(0xFFF1);
    attributes.collectionBehavior = CollectionBehaviors::fromInt(257);
    attributes.level = static_cast<WindowLevel>(-3);
    attributes.sharingType = SharingType::none;
    attributes.titleVisibility = TitleVisibility::hidden;
    attributes.animationBehavior = AnimationBehavior::alertPanel;
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

// What a native window of the desktop that the words come from is sent.
TEST_F(WindowAttribute, namesHaveTheirRawValues)
{
    const auto raw = [](auto value) { return static_cast<int>(value); };

    EXPECT_EQ(raw(StyleMask::titled), 1);
    EXPECT_EQ(raw(StyleMask::closable), 2);
    EXPECT_EQ(raw(StyleMask::miniaturizable), 4);
    EXPECT_EQ(raw(StyleMask::resizable), 8);
    EXPECT_EQ(raw(StyleMask::unifiedTitleAndToolbar), 4096);
    EXPECT_EQ(raw(StyleMask::fullSizeContentView), 32768);
    EXPECT_EQ(raw(CollectionBehavior::canJoinAllSpaces), 1);
    EXPECT_EQ(raw(CollectionBehavior::fullScreenAuxiliary), 256);
    EXPECT_EQ(everywhere.toInt(), 257U);
    EXPECT_EQ(raw(WindowLevel::normal), 0);
    EXPECT_EQ(raw(WindowLevel::mainMenu), 24);
    EXPECT_EQ(raw(SharingType::none), 0);
    EXPECT_EQ(raw(SharingType::readOnly), 1);
    EXPECT_EQ(raw(TitleVisibility::visible), 0);
    EXPECT_EQ(raw(TitleVisibility::hidden), 1);
    EXPECT_EQ(raw(AnimationBehavior::byDefault), 0);
    EXPECT_EQ(raw(AnimationBehavior::utilityWindow), 4);
    EXPECT_EQ(raw(AnimationBehavior::alertPanel), 5);
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
    borderless.styleMask = {};

    m_window.setAttributes(borderless);

    EXPECT_TRUE(m_window.testAttribute(Qt::WA_ShowWithoutActivating));
}

TEST_F(WindowAttribute, windowStaysOnTheScreenWhenItsFlagsChange)
{
    show(m_window);
    WindowAttributes attributes;
    attributes.level = WindowLevel::mainMenu;

    m_window.setAttributes(attributes);

    EXPECT_TRUE(m_window.isVisible());
    EXPECT_TRUE(m_window.windowFlags().testFlag(Qt::WindowStaysOnTopHint));
    EXPECT_EQ(m_delegate.take(), Log {});
}

TEST_F(WindowAttribute, hiddenWindowStaysHiddenWhenItsFlagsChange)
{
    WindowAttributes attributes;
    attributes.level = WindowLevel::mainMenu;

    m_window.setAttributes(attributes);

    EXPECT_FALSE(m_window.isVisible());
}

} // namespace penwick::platform
