// SPDX-License-Identifier: MIT
// What the banner says, in pixels.
#include "session/BannerLabel.h"

#include <QFontMetricsF>
#include <QImage>
#include <QTest>

#include <gtest/gtest.h>

#include <cmath>
#include <functional>

namespace penwick::test {

namespace {

constexpr QSize labelSize { 300, 40 };
constexpr QColor below { 128, 128, 128 }; // of neither colour of the letters

/// The label alone, over what lies below the banner.
QImage pictureOf(BannerLabel &label, QSize size = labelSize)
{
    QImage picture(size, QImage::Format_RGB32);
    picture.fill(below);
    label.resize(size);
    label.render(&picture, QPoint(), QRegion(), QWidget::DrawChildren);
    return picture;
}

/// The smallest rectangle around the pixels of a certain kind.
QRect around(const QImage &picture, const std::function<bool(QColor)> &isWanted)
{
    QRect all;
    for (int y = 0; y < picture.height(); ++y) {
        for (int x = 0; x < picture.width(); ++x) {
            if (isWanted(picture.pixelColor(x, y)))
                all |= QRect(x, y, 1, 1);
        }
    }
    return all;
}

QRect letters(const QImage &picture)
{
    return around(picture, [](const QColor &color) { return color.lightness() > 200; });
}

QRect outline(const QImage &picture)
{
    return around(picture, [](const QColor &color) { return color.lightness() < 60; });
}

} // namespace

TEST(BannerLabel, lettersAreInTheMiddleAndAsHighAsTheirSizeSays)
{
    BannerLabel label;
    label.setText(QStringLiteral("HHHHHH"));
    QFont font = label.font();
    font.setPixelSize(16);
    font.setWeight(QFont::DemiBold);
    const QFontMetricsF metrics(font);

    const QRect shown = letters(pictureOf(label));

    EXPECT_NEAR((shown.left() + shown.right() + 1) / 2.0, labelSize.width() / 2.0, 1.5);
    EXPECT_NEAR(shown.width(), metrics.tightBoundingRect(label.text()).width(), 2.0);
    EXPECT_NEAR(shown.height(), metrics.capHeight(), 1.0);
    const double baseline = (labelSize.height() + metrics.ascent() - metrics.descent()) / 2;
    EXPECT_NEAR(shown.bottom() + 1, baseline, 1.0);
    EXPECT_EQ(label.font().pixelSize(), 16);
    EXPECT_EQ(label.font().weight(), QFont::DemiBold);
}

TEST(BannerLabel, lettersHaveADarkOutlineOfTwoPoints)
{
    BannerLabel label;
    label.setText(QStringLiteral("HHHHHH"));

    const QImage picture = pictureOf(label);

    const QRect light = letters(picture);
    const QRect dark = outline(picture);
    EXPECT_NEAR(light.left() - dark.left(), 2, 1);
    EXPECT_NEAR(dark.right() - light.right(), 2, 1);
    EXPECT_NEAR(light.top() - dark.top(), 2, 1);
    EXPECT_NEAR(dark.bottom() - light.bottom(), 2, 1);
}

TEST(BannerLabel, needsTheWidthOfItsLettersAndOfTheirOutline)
{
    BannerLabel label;
    EXPECT_EQ(label.widthOfText(), 4.0);

    label.setText(QStringLiteral("HHHHHH"));

    EXPECT_EQ(label.widthOfText(),
        QFontMetricsF(label.font()).horizontalAdvance(QStringLiteral("HHHHHH")) + 4.0);
}

TEST(BannerLabel, textThatDoesNotFitWithItsOutlineIsCutShort)
{
    BannerLabel label;
    label.setText(QStringLiteral("HHHHHH"));
    const QSize enough(static_cast<int>(std::ceil(label.widthOfText())), 40);
    const QSize tooNarrow = enough - QSize(2, 0);
    BannerLabel cut;
    cut.setText(QFontMetricsF(label.font())
                    .elidedText(label.text(), Qt::ElideRight, tooNarrow.width() - 4));
    ASSERT_TRUE(cut.text().endsWith(QChar(0x2026)));

    EXPECT_EQ(pictureOf(label, tooNarrow), pictureOf(cut, tooNarrow));
    EXPECT_NE(pictureOf(label, enough), pictureOf(cut, enough));
}

TEST(BannerLabel, newTextIsShownAtOnceAndHeardByAssistivePrograms)
{
    BannerLabel label;
    label.setText(QStringLiteral("shared"));
    label.show();
    ASSERT_TRUE(QTest::qWaitForWindowExposed(&label));
    const QImage before = pictureOf(label);
    int paints = 0;
    class Counter final : public QObject
    {
    public:
        explicit Counter(int &count)
            : m_count(count)
        { }
        bool eventFilter(QObject *, QEvent *event) override
        {
            m_count += event->type() == QEvent::Paint;
            return false;
        }

    private:
        int &m_count;
    } counter(paints);
    QCoreApplication::processEvents();
    label.installEventFilter(&counter);

    label.setText(QStringLiteral("not shared"));

    EXPECT_TRUE(QTest::qWaitFor([&paints] { return paints > 0; }));
    EXPECT_EQ(label.text(), QStringLiteral("not shared"));
    EXPECT_EQ(label.accessibleName(), QStringLiteral("not shared"));
    EXPECT_NE(pictureOf(label), before);
}

} // namespace penwick::test
