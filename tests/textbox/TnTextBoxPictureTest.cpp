// SPDX-License-Identifier: MIT
// What a box looks like, by its pixels.
#include "textbox/TextBoxFixture.h"

#include <QInputMethodEvent>
#include <QPainter>

namespace penwick::test {
namespace {

class TnTextBoxPictureTest : public TextBoxFixture
{
protected:
    static constexpr QRgb editBorder = qRgb(51, 51, 255); // blue at alpha 0.8 on white
    static constexpr QRgb placedBorder = qRgb(153, 153, 255); // at alpha 0.4

    /// '#' for pixels in `colour`, '.' for others, along a row or a column.
    static std::string row(const QImage &picture, int y, QRgb colour)
    {
        std::string pixels;
        for (int x = 0; x < picture.width(); ++x)
            pixels += isNear(picture.pixel(x, y), colour) ? '#' : '.';
        return pixels;
    }
    static std::string column(const QImage &picture, int x, QRgb colour)
    {
        std::string pixels;
        for (int y = 0; y < picture.height(); ++y)
            pixels += isNear(picture.pixel(x, y), colour) ? '#' : '.';
        return pixels;
    }

    /// Dashes of 5 with gaps of 4 from `start`, `length` long, in a line of `whole`.
    static std::string dashes(int start, int length, int whole)
    {
        std::string pixels(static_cast<std::size_t>(whole), '.');
        for (int place = start; place < start + length; ++place) {
            if ((place - start) % 9 < 5)
                pixels[static_cast<std::size_t>(place)] = '#';
        }
        return pixels;
    }

    static QImage inside(const QImage &picture)
    {
        return picture.copy(picture.rect().adjusted(4, 4, -4, -4));
    }

    /// `part` of the box on white, painted alone.
    static QImage painted(TnTextBox &box, const QRect &part)
    {
        QImage picture(part.size(), QImage::Format_RGB32);
        picture.fill(Qt::white);
        box.render(&picture, {}, part, QWidget::DrawChildren);
        return picture;
    }

private:
    static bool isNear(QRgb one, QRgb other)
    {
        return std::abs(qRed(one) - qRed(other)) <= 1 && std::abs(qGreen(one) - qGreen(other)) <= 1
            && std::abs(qBlue(one) - qBlue(other)) <= 1;
    }
};

TEST_F(TnTextBoxPictureTest, boxThatIsEditedHasADashedBorderTwoWideInsideItsBounds)
{
    const auto box = newBox();

    const QImage picture = pictureOf(*box);

    ASSERT_EQ(picture.size(), QSize(200, 30));
    // A rectangle from (2, 2), 197 x 27, clockwise from its top left corner; the border of four
    // sides is 448 long and the pattern goes on around the corners.
    const std::string top = dashes(2, 197, 200);
    EXPECT_EQ(row(picture, 1, editBorder), top);
    EXPECT_EQ(row(picture, 2, editBorder).substr(3, 190), top.substr(3, 190)); // the corner apart
    EXPECT_EQ(row(picture, 0, editBorder), std::string(200, '.'));
    // The right side goes on 197 % 9 = 8 into the pattern: a gap of one comes first.
    const std::string right = dashes(3, 26, 30);
    EXPECT_EQ(column(picture, 198, editBorder).substr(3, 24), right.substr(3, 24));
    EXPECT_EQ(column(picture, 199, editBorder).substr(3, 24), right.substr(3, 24));
    // The bottom goes on 224 % 9 = 8 into it, from the right: a gap of one again.
    const std::string bottom = row(picture, 28, editBorder);
    EXPECT_EQ(std::string(bottom.rbegin(), bottom.rend()).substr(5, 190),
        dashes(2, 197, 200).substr(5, 190));
    EXPECT_EQ(row(picture, 28, editBorder), row(picture, 29, editBorder));
    EXPECT_EQ(column(picture, 0, editBorder), std::string(30, '.'));
    EXPECT_NE(column(picture, 1, editBorder), std::string(30, '.'));
}

TEST_F(TnTextBoxPictureTest, borderStaysWholeWhileTyping)
{
    const auto box = newBox();

    QTest::keyClicks(box.get(), QStringLiteral("Hello"));
    settle();

    EXPECT_EQ(row(pictureOf(*box), 1, editBorder), dashes(2, 197, 200));
}

// The dashes go on around the corners, also where another box lies over one of them.
TEST_F(TnTextBoxPictureTest, dashesStandWhereTheyAreWhateverPartIsPainted)
{
    const auto box = newBox();
    const QImage whole = painted(*box, box->QWidget::rect());
    ASSERT_EQ(row(whole, 1, editBorder), dashes(2, 197, 200));

    for (const QRect &part : { QRect(0, 0, 164, 18), QRect(0, 0, 4, 30), QRect(0, 15, 90, 15),
             QRect(150, 26, 50, 4), QRect(190, 10, 10, 9) })
        EXPECT_TRUE(painted(*box, part) == whole.copy(part)) << part.x() << ", " << part.y();
}

TEST_F(TnTextBoxPictureTest, placedBoxHasASolidBorderThreeWideInsideItsBounds)
{
    const auto box = placedBox();

    const QImage picture = pictureOf(*box);

    const std::string whole(200, '#');
    for (const int y : { 0, 1, 2, picture.height() - 3, picture.height() - 1 })
        EXPECT_EQ(row(picture, y, placedBorder).substr(1, 198), whole.substr(1, 198)) << y;
    const std::string sides = "###" + std::string(194, '.') + "###";
    EXPECT_EQ(row(picture, 3, placedBorder), sides);
    EXPECT_EQ(row(picture, 3, editBorder), std::string(200, '.'));
}

TEST_F(TnTextBoxPictureTest, boxThatIsEditedAgainHasTheDashedBorderOnly)
{
    const auto box = placedBox();

    doubleClickOn(*box, { 20, 15 });
    settle();

    const QImage picture = pictureOf(*box);
    EXPECT_EQ(row(picture, 1, editBorder), dashes(2, 197, 200));
    EXPECT_EQ(row(picture, 0, placedBorder), std::string(200, '.'));
}

TEST_F(TnTextBoxPictureTest, emptyBoxShowsThePlaceholderInHalfTheTextsColour)
{
    const auto box = newBox();
    leave(); // without its caret
    box->show();

    const QImage shown = box->grab().toImage().convertToFormat(QImage::Format_RGB32);
    const int grey = darkest(inside(shown));

    EXPECT_NEAR(grey, placeholderGrey, 8);
    EXPECT_EQ(box->toPlainText(), QString());
}

TEST_F(TnTextBoxPictureTest, placeholderBeginsWhereTheTextDoes)
{
    const auto box = newBox();
    leave();
    box->show();
    QImage expected(box->size(), QImage::Format_RGB32);
    expected.fill(Qt::white);
    QPainter painter(&expected);
    const platform::AttributedString &hint = box->placeholderAttributedString();
    painter.setFont(hint.font);
    painter.setPen(hint.foregroundColor);
    painter.drawText(QRectF(5, 6, 190, 24), Qt::AlignTop | Qt::AlignJustify, hint.string);
    painter.end();

    QImage shown(box->size(), QImage::Format_RGB32);
    shown.fill(Qt::white);
    box->render(&shown, {}, {}, QWidget::DrawChildren);

    EXPECT_EQ(inside(shown), inside(expected));
}

TEST_F(TnTextBoxPictureTest, placeholderIsGoneOnceThereIsText)
{
    const auto box = newBox();
    const QRect farRight(120, 4, 70, 20);
    ASSERT_LT(darkest(pictureOf(*box).copy(farRight)), paper);

    QTest::keyClicks(box.get(), QStringLiteral("."));
    settle();

    EXPECT_EQ(darkest(pictureOf(*box).copy(farRight)), paper);

    QTest::keyClick(box.get(), Qt::Key_Backspace);
    settle();
    EXPECT_LT(darkest(pictureOf(*box).copy(farRight)), paper);
}

TEST_F(TnTextBoxPictureTest, textIsInTheBoxesColour)
{
    canvas->setBrushColor(TnhColors::redColor);
    const auto box = placedBox({ 20, 124 }, QStringLiteral("MMM"));

    const QImage picture = inside(pictureOf(*box));

    bool isFound = false;
    for (int y = 0; y < picture.height() && !isFound; ++y) {
        for (int x = 0; x < picture.width() && !isFound; ++x)
            isFound = picture.pixel(x, y) == TnhColors::redColor.rgb();
    }
    EXPECT_TRUE(isFound);
}

TEST_F(TnTextBoxPictureTest, boxHasNoBackground)
{
    stroke({ { 100, 115 }, { 200, 115 } });

    newBox();

    EXPECT_EQ(greyAt(onScreen(), { 195, 115 }), ink);
}

TEST_F(TnTextBoxPictureTest, caretIsInTheTextsColourAndOnlyWhileEditing)
{
    canvas->setBrushColor(TnhColors::redColor);
    const auto box = newBox();
    const QPoint caret = box->cursorRect().topLeft() + QPoint(0, 4);

    EXPECT_EQ(pictureOf(*box).pixelColor(caret), TnhColors::redColor);
    EXPECT_EQ(pictureOf(*box).pixelColor(caret + QPoint(1, 0)), TnhColors::redColor);

    QTest::keyClicks(box.get(), QStringLiteral("a"));
    leave();
    const QPoint end = box->cursorRect().topLeft() + QPoint(0, 4);
    EXPECT_EQ(pictureOf(*box).pixelColor(end), QColor(Qt::white));
}

// The editor's own caret, which inverts what is below it, has the width 0. Yet at scales between
// whole numbers the toolkit would paint it as a hairline.
TEST_F(TnTextBoxPictureTest, noOtherCaretIsPaintedAtAnyScale)
{
    canvas->setBrushColor(TnhColors::redColor);
    const auto box = newBox();
    for (const double scale : { 1.0, 1.25, 1.5, 1.75, 2.0 }) {
        QImage picture((QSizeF(box->QWidget::size()) * scale).toSize(), QImage::Format_RGB32);
        picture.setDevicePixelRatio(scale);
        picture.fill(Qt::white);

        box->render(&picture, {}, {}, QWidget::DrawChildren);

        EXPECT_GT(darkest(picture), 40) << scale; // the red caret and the blue border
    }
}

TEST_F(TnTextBoxPictureTest, selectedTextIsWhiteOnTheSelectionsColour)
{
    const auto box = newBox();
    QTest::keyClicks(box.get(), QStringLiteral("HHHHHH"));
    settle();
    const QRect text(box->cursorRect().topLeft() - QPoint(40, -2), QSize(36, 16));
    ASSERT_EQ(row(pictureOf(*box).copy(text), 1, qRgb(255, 255, 255)).find("####"), 0U);

    box->selectAll();
    settle();

    const QImage selected = pictureOf(*box).copy(text);
    const QRgb ground = box->palette().color(QPalette::Active, QPalette::Highlight).rgb();
    EXPECT_NE(row(selected, 8, ground).find('#'), std::string::npos);
    EXPECT_NE(row(selected, 8, qRgb(255, 255, 255)).find('#'), std::string::npos);
    EXPECT_EQ(row(selected, 8, qRgb(textGrey, textGrey, textGrey)).find('#'), std::string::npos);
}

TEST_F(TnTextBoxPictureTest, caretIsPaintedOnlyWhereTheKeysGo)
{
    canvas->setBrushColor(TnhColors::redColor);
    const auto box = newBox();
    const QPoint caret = box->cursorRect().topLeft() + QPoint(0, 4);
    ASSERT_EQ(pictureOf(*box).pixelColor(caret), TnhColors::redColor);

    box->clearFocus();
    QFocusEvent in(QEvent::FocusIn, Qt::OtherFocusReason); // tells of a focus that is gone
    QCoreApplication::sendEvent(box.get(), &in);
    ASSERT_FALSE(box->hasFocus());
    settle();

    EXPECT_NE(pictureOf(*box).pixelColor(caret), TnhColors::redColor);
}

TEST_F(TnTextBoxPictureTest, shorterDirtyRectangleDrawsNoDashedBorder)
{
    // drawBorder() is called directly, because draw() always asks for the whole border. For half of
    // the height it draws none.
    class HalfBorder final : public QObject
    {
    public:
        explicit HalfBorder(TnTextBox &box)
            : m_box(box)
        {
            box.viewport()->installEventFilter(this);
        }
        bool eventFilter(QObject *, QEvent *event) override
        {
            if (event->type() != QEvent::Paint)
                return false;
            m_box.drawBorder({ 0, 0, m_box.bounds().width, m_box.bounds().height / 2 });
            return true;
        }

    private:
        TnTextBox &m_box;
    };
    const auto box = newBox();
    const HalfBorder half(*box);

    box->setNeedsDisplay();
    settle();

    EXPECT_EQ(row(pictureOf(*box), 1, editBorder), std::string(200, '.'));
}

} // namespace
} // namespace penwick::test
