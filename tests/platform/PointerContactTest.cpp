// SPDX-License-Identifier: MIT
// Which events go on with a contact, and when a press is a drag.
#include "platform/view/PointerContact.h"

#include <gtest/gtest.h>

#include <QMouseEvent>
#include <QPointingDevice>
#include <QTabletEvent>

#include <optional>

namespace penwick::platform {

namespace {

using PointerType = QPointingDevice::PointerType;

class Device final : public QPointingDevice
{
public:
    explicit Device(PointerType type)
        : QPointingDevice(QStringLiteral("device"), static_cast<qint64>(type) + 2000,
            type == PointerType::Generic ? DeviceType::Mouse : DeviceType::Stylus, type,
            Capability::Position, 1, 3)
    { }
};

QMouseEvent mouse(QEvent::Type type, const QPointingDevice &device)
{
    return { type, {}, {}, {}, Qt::LeftButton, Qt::LeftButton, Qt::NoModifier, &device };
}

QTabletEvent tablet(QEvent::Type type, const QPointingDevice &device)
{
    return { type, &device, {}, {}, 0.5, 0, 0, 0, 0, 0, Qt::NoModifier, Qt::LeftButton,
        Qt::LeftButton };
}

class PointerContactTest : public testing::Test
{
protected:
    const Device m_mouse { PointerType::Generic };
    const Device m_tip { PointerType::Pen };
    const Device m_eraser { PointerType::Eraser };
    PointerContact m_contact;
};

} // namespace

TEST_F(PointerContactTest, onlyWhatBeganItGoesOnWithItAndNoOtherPressBeginsAnother)
{
    const QMouseEvent asMouse = mouse(QEvent::MouseButtonPress, m_mouse);
    const QMouseEvent penAsMouse = mouse(QEvent::MouseButtonPress, m_tip);
    const QTabletEvent pen = tablet(QEvent::TabletPress, m_tip);
    const QPointerEvent *const presses[] { &asMouse, &penAsMouse, &pen };
    for (const QPointerEvent *const press : presses) {
        m_contact.begin(*press, {}, 1);
        EXPECT_TRUE(m_contact.isOn());
        for (const QPointerEvent *const other : presses) {
            EXPECT_EQ(m_contact.isContinuedBy(*other), other == press);
            EXPECT_EQ(m_contact.excludes(*other), other != press);
        }
    }
    EXPECT_TRUE(m_contact.end());
    EXPECT_FALSE(m_contact.end());
    for (const QPointerEvent *const press : presses) {
        EXPECT_FALSE(m_contact.isContinuedBy(*press));
        EXPECT_FALSE(m_contact.excludes(*press));
    }
}

TEST_F(PointerContactTest, deviceThatIsGoneExcludesNobody)
{
    std::optional<Device> gone(std::in_place, PointerType::Pen);
    m_contact.begin(tablet(QEvent::TabletPress, *gone), {}, 1);

    gone.reset();

    EXPECT_FALSE(m_contact.excludes(mouse(QEvent::MouseButtonPress, m_mouse)));
}

TEST_F(PointerContactTest, contactOfAPenIsOverWhenThePenHoversAndNotWhenAMouseDoes)
{
    m_contact.begin(tablet(QEvent::TabletPress, m_tip), {}, 1);
    EXPECT_TRUE(m_contact.isBeliedBy(mouse(QEvent::MouseMove, m_tip)));
    EXPECT_FALSE(m_contact.isBeliedBy(mouse(QEvent::MouseMove, m_mouse)));

    m_contact.begin(mouse(QEvent::MouseButtonPress, m_mouse), {}, 1);
    EXPECT_FALSE(m_contact.isBeliedBy(mouse(QEvent::MouseMove, m_tip)));
}

TEST_F(PointerContactTest, contactOfAMouseIsOverWhenTheMouseHovers)
{
    m_contact.begin(mouse(QEvent::MouseButtonPress, m_mouse), {}, 1);

    EXPECT_TRUE(m_contact.isBeliedBy(mouse(QEvent::MouseMove, m_mouse)));
}

TEST_F(PointerContactTest, pressIsADragOnceItHasBeenFarEnoughAway)
{
    m_contact.begin(mouse(QEvent::MouseButtonPress, m_mouse), { 10, 10 }, 2);
    EXPECT_EQ(m_contact.clickCount(), 2);
    EXPECT_FALSE(m_contact.isDrag({ 13, 6.5 }, 7.0));
    EXPECT_TRUE(m_contact.isDrag({ 7, 14 }, 7.0));
    EXPECT_TRUE(m_contact.isDrag({ 10, 10 }, 7.0));

    m_contact.begin(mouse(QEvent::MouseButtonPress, m_mouse), { 10, 10 }, 1);
    EXPECT_FALSE(m_contact.isDrag({ 10, 11 }, 7.0));
    EXPECT_TRUE(m_contact.isDrag({ 10, 10 }, 0.0));
}

TEST_F(PointerContactTest, endOfAPenIsKnownInEitherWay)
{
    EXPECT_EQ(penEndOf(mouse(QEvent::MouseMove, m_mouse)), PenEnd::None);
    EXPECT_EQ(penEndOf(mouse(QEvent::MouseMove, m_eraser)), PenEnd::Eraser);
    EXPECT_EQ(penEndOf(tablet(QEvent::TabletMove, m_eraser)), PenEnd::Eraser);
    EXPECT_EQ(penEndOf(tablet(QEvent::TabletMove, m_tip)), PenEnd::Tip);
}

} // namespace penwick::platform
