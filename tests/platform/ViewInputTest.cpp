// SPDX-License-Identifier: MIT
// What is told of presses and keys before the view itself hears of them.
#include "platform/view/ViewInput.h"

#include "platform/view/Button.h"
#include "platform/view/PlainView.h"

#include <QTest>

#include <gtest/gtest.h>

namespace penwick::platform {

TEST(ViewInput, pressIsToldOnceAndOfTheLeftButtonAlone)
{
    PlainView view;
    view.setFrame({ 0, 0, 50, 50 });
    std::vector<const View *> pressed;
    QObject context;
    QObject::connect(&ViewInput::shared(), &ViewInput::pressed, &context,
        [&](View &told) { pressed.push_back(&told); });

    QTest::mousePress(&view, Qt::RightButton);
    QTest::mouseRelease(&view, Qt::RightButton);
    EXPECT_EQ(pressed, std::vector<const View *> {});
    QTest::mousePress(&view, Qt::LeftButton);
    QTest::mouseRelease(&view, Qt::LeftButton);
    EXPECT_EQ(pressed, std::vector<const View *> { &view });
}

TEST(ViewInput, pressOnADisabledButtonIsToldOnceAndOfItAlone)
{
    PlainView around;
    Button button(&around);
    button.setEnabled(false);
    button.setAction([](Button &) { FAIL() << "a disabled button does nothing"; });
    std::vector<const View *> pressed;
    QObject context;
    QObject::connect(&ViewInput::shared(), &ViewInput::pressed, &context,
        [&](View &told) { pressed.push_back(&told); });

    QTest::mouseClick(&button, Qt::RightButton);
    EXPECT_EQ(pressed, std::vector<const View *> {});
    QTest::mouseClick(&button, Qt::LeftButton);
    EXPECT_EQ(pressed, std::vector<const View *> { &button });
    QTest::mouseDClick(&button, Qt::LeftButton); // only the second press of one
    EXPECT_EQ(pressed, (std::vector<const View *> { &button, &button }));
}

TEST(ViewInput, keyIsToldAndStillReachesTheView)
{
    class Typed final : public ViewOf<QWidget>
    {
    public:
        bool hasTyped = false;

    protected:
        void keyPressEvent(QKeyEvent *) override { hasTyped = true; }
    };
    Typed view;
    std::vector<bool> hadTyped;
    QObject context;
    QObject::connect(&ViewInput::shared(), &ViewInput::keyPressed, &context,
        [&](View &told) { hadTyped.push_back(&told == &view && view.hasTyped); });

    QTest::keyClick(&view, Qt::Key_A);

    EXPECT_EQ(hadTyped, std::vector<bool> { false });
    EXPECT_TRUE(view.hasTyped);
}

} // namespace penwick::platform
