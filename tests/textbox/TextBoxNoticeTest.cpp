// SPDX-License-Identifier: MIT
// What is said at a box: shown below it.
#include "textbox/TextBoxNotice.h"

#include "textbox/TextBoxFixture.h"

#include <QToolTip>

#include <optional>

namespace penwick::test {
namespace {

class TextBoxNoticeTest : public TextBoxFixture
{
protected:
    ~TextBoxNoticeTest() override { QToolTip::hideText(); }

    /// Where the toolkit shows a tool tip now, on the screen.
    static std::optional<QPoint> placeOfToolTip()
    {
        for (const QWidget *const widget : QApplication::topLevelWidgets()) {
            if (widget->isVisible() && widget->inherits("QTipLabel"))
                return widget->pos();
        }
        return std::nullopt;
    }
};

TEST_F(TextBoxNoticeTest, isSeenAtTheBottomLeftCornerOfItsBox)
{
    const auto box = newBox({ 60, 150 });

    sayAt(*box, QStringLiteral("No room"));
    const auto place = placeOfToolTip();
    EXPECT_EQ(QToolTip::text(), QStringLiteral("No room"));
    QToolTip::showText(box->mapToGlobal(box->QWidget::rect().bottomLeft() + QPoint(0, 1)),
        QStringLiteral("No  room")); // another text, so that it is placed anew

    ASSERT_TRUE(place);
    EXPECT_EQ(place, placeOfToolTip());
}

} // namespace
} // namespace penwick::test
