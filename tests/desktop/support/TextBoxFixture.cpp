// SPDX-License-Identifier: MIT
#include "desktop/support/TextBoxFixture.h"

#include <cstdlib>

namespace penwick::desktop {

namespace {

constexpr QPoint onDash(4, 1); // from the corner: where the dashed border has its first dash
constexpr QPoint onGap(9, 1); // and its first gap, which a placed border has not

bool isNear(const QColor &one, const QColor &other)
{
    return std::abs(one.red() - other.red()) <= 1 && std::abs(one.green() - other.green()) <= 1
        && std::abs(one.blue() - other.blue()) <= 1;
}

} // namespace

void TextBoxTest::openForText()
{
    open(HostProgram::Steered);
    host().selectTool(QStringLiteral("text"));
    desktop().pointer().moveTo(onScreen(farAway));
}

QPoint TextBoxTest::makeBox(QPoint place)
{
    click(place);
    require([&] { return isEdited(boxOf(place)); }, "a text box to be edited");
    return boxOf(place);
}

QPoint TextBoxTest::placeBox(QPoint place, std::string_view text)
{
    const QPoint corner = makeBox(place);
    type(corner, text);
    click(farAway);
    require([&] { return comesToBePlaced(corner); }, "a text box to be placed");
    return corner;
}

void TextBoxTest::type(QPoint corner, std::string_view text)
{
    const int before = inked(corner).width();
    desktop().keyboard().type(text);
    require([&] { return inked(corner).width() > before; }, "what was typed to appear");
}

void TextBoxTest::doubleClick(QPoint place)
{
    click(place);
    click(place);
}

bool TextBoxTest::isEdited(QPoint corner)
{
    return isNear(at(corner + onDash), editBorder) && isNear(at(corner + onGap), Qt::white);
}

bool TextBoxTest::comesToBeEdited(QPoint corner)
{
    return waitUntil([&] { return isEdited(corner); });
}

bool TextBoxTest::comesToBePlaced(QPoint corner)
{
    return waitUntil([&] {
        return isNear(at(corner + onDash), placedBorder)
            && isNear(at(corner + onGap), placedBorder);
    });
}

bool TextBoxTest::vanishes(QPoint corner)
{
    return waitUntil([&] {
        return isNear(at(corner + onDash), Qt::white) && isNear(at(corner + onGap), Qt::white);
    });
}

QPoint TextBoxTest::deleteButtonOf(QPoint corner, int width)
{
    return corner + QPoint(width + 1 + 10, -1 - 20 + 10);
}

bool TextBoxTest::deleteButtonComesToBe(QPoint corner, const QColor &color)
{
    const QPoint besideTheCross = deleteButtonOf(corner) - QPoint(0, 6);
    return waitUntil([&] { return isNear(at(besideTheCross), color); });
}

QRect TextBoxTest::inked(QPoint corner)
{
    // Text is darker than the placeholder; the caret, at the text's end, counts as text.
    const QRect area(corner + QPoint(10, 3), QSize(newBoxSize.width() - 13, newBoxSize.height()));
    const QImage image = pictureOf(area);
    QRect found;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            const QColor color = image.pixelColor(x, y);
            if (color.blue() < 90)
                found |= QRect(x, y, 1, 1);
        }
    }
    return found;
}

QImage TextBoxTest::pictureOf(const QRect &area)
{
    return desktop().screen().picture(area.translated(canvas().topLeft()));
}

QRect TextBoxTest::extentOf(const QColor &color, const QRect &area)
{
    const QImage image = pictureOf(area);
    QRect found;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            if (isNear(image.pixelColor(x, y), color))
                found |= QRect(area.topLeft() + QPoint(x, y), QSize(1, 1));
        }
    }
    return found;
}

} // namespace penwick::desktop
