// SPDX-License-Identifier: MIT
// Texts in places that are too narrow for them.
#include "platform/view/FittedText.h"

#include "platform/view/OwnLook.h"

#include <QFontMetricsF>

#include <gtest/gtest.h>

namespace penwick::platform {

namespace {

double widthOf(const QString &text, const QFont &font)
{
    return QFontMetricsF(font).horizontalAdvance(text);
}

const QString word = QStringLiteral("Sitzungsende");

} // namespace

TEST(FittedText, thatFitsStaysAsItIs)
{
    const QFont font = ownFont(20);

    const FittedText fitted = fittedText(word, font, widthOf(word, font));

    EXPECT_EQ(fitted.string, word);
    EXPECT_EQ(fitted.font, font);
    EXPECT_TRUE(fitted.isWhole);
}

TEST(FittedText, thatIsALittleTooLongGetsTheLargestSizeThatFits)
{
    const double room = widthOf(word, ownFont(14));

    const FittedText fitted = fittedText(word, ownFont(20), room);

    EXPECT_EQ(fitted.string, word);
    EXPECT_FALSE(fitted.isWhole);
    EXPECT_LE(widthOf(word, fitted.font), room);
    EXPECT_GE(fitted.font.pixelSize(), 14);
    QFont larger = fitted.font;
    larger.setPixelSize(fitted.font.pixelSize() + 1);
    EXPECT_GT(widthOf(word, larger), room);
}

TEST(FittedText, thatNobodyCouldReadIsShortenedInstead)
{
    const double room = widthOf(word, ownFont(9)) - 1;

    const FittedText fitted = fittedText(word, ownFont(20), room);

    EXPECT_EQ(fitted.font.pixelSize(), 9);
    EXPECT_FALSE(fitted.isWhole);
    EXPECT_TRUE(fitted.string.startsWith(QLatin1Char('S')));
    EXPECT_TRUE(fitted.string.endsWith(QChar(0x2026)));
    EXPECT_LE(widthOf(fitted.string, fitted.font), room);
}

TEST(FittedText, isReadableAtNineStill)
{
    const FittedText fitted = fittedText(word, ownFont(20), widthOf(word, ownFont(9)));

    EXPECT_EQ(fitted.string, word);
    EXPECT_EQ(fitted.font.pixelSize(), 9);
}

} // namespace penwick::platform
