// SPDX-License-Identifier: MIT
// Whether the images can be told from what lies behind them, computed from the painted pixels.
//
// The tone that carries the shape of an image, at the latest that of its outline, has a contrast of
// at least 3 to 1 against the button's background in every state, and of 4.5 to 1 when the desktop
// asks for more contrast. That is measured along the shape's edge: close to each of its pixels
// there is such a tone. Exceptions, by their design:
// - the white triangle on the hover colour (2.66);
// - an end button that was toggled, which is on its way off the screen;
// - disabled buttons;
// - the fills of the colour swatches, which therefore have a ring.
#include "toolpanel/ToolPanelFixture.h"

#include <algorithm>
#include <cmath>

namespace penwick::test {

namespace {

constexpr double scale = 4.0; // device pixels to a point: few of them are mixed tones
constexpr int reach = 8; // device pixels, two points: from the edge to the tone that carries it

double linear(int component)
{
    const double value = component / 255.0;
    return value <= 0.04045 ? value / 12.92 : std::pow((value + 0.055) / 1.055, 2.4);
}

double luminance(QRgb color)
{
    return 0.2126 * linear(qRed(color)) + 0.7152 * linear(qGreen(color))
        + 0.0722 * linear(qBlue(color));
}

double contrast(QRgb one, QRgb other)
{
    const auto [darker, lighter] = std::minmax({ luminance(one), luminance(other) });
    return (lighter + 0.05) / (darker + 0.05);
}

/// What a button shows on its background.
class Shape
{
public:
    explicit Shape(ToolPanelButton &button)
        : m_picture(paintedBy(button, scale).convertToFormat(QImage::Format_RGB32))
        , m_background(button.backgroundColor().rgb())
    {
        if (button.identifier() == QStringLiteral("text")
            || button.identifier() == QStringLiteral("brush"))
            removeTriangle();
    }

    [[nodiscard]] bool isEmpty() const { return edge().empty(); }

    /// The lowest, along the edge, of the highest contrasts within reach.
    [[nodiscard]] double contrastOfEdge() const
    {
        double lowest = 21.0;
        for (const QPoint place : edge())
            lowest = std::min(lowest, highestAround(place));
        return lowest;
    }

private:
    [[nodiscard]] bool isShape(int x, int y) const
    {
        return m_picture.rect().contains(x, y)
            && (m_picture.pixel(x, y) | 0xff000000U) != m_background;
    }

    [[nodiscard]] std::vector<QPoint> edge() const
    {
        std::vector<QPoint> places;
        for (int y = margin; y < m_picture.height() - margin; ++y) {
            for (int x = margin; x < m_picture.width() - margin; ++x) {
                const bool isInside = isShape(x - 1, y) && isShape(x + 1, y) && isShape(x, y - 1)
                    && isShape(x, y + 1);
                if (isShape(x, y) && !isInside)
                    places.emplace_back(x, y);
            }
        }
        return places;
    }

    [[nodiscard]] double highestAround(QPoint place) const
    {
        double highest = 1.0;
        for (int y = place.y() - reach; y <= place.y() + reach; y += 2) {
            for (int x = place.x() - reach; x <= place.x() + reach; x += 2) {
                if (isShape(x, y))
                    highest = std::max(highest, contrast(m_picture.pixel(x, y), m_background));
            }
        }
        return highest;
    }

    void removeTriangle()
    {
        const int corner = static_cast<int>(8 * scale);
        QPainter painter(&m_picture);
        painter.scale(1 / scale, 1 / scale);
        painter.fillRect(m_picture.width() - corner, m_picture.height() - corner, corner, corner,
            QColor::fromRgb(m_background));
    }

    static constexpr int margin = 4; // of rounded corners

    QImage m_picture;
    QRgb m_background;
};

class ToolImageContrast : public ToolPanelFixture, public testing::WithParamInterface<bool>
{
protected:
    ToolImageContrast() { m_contrast.setIncreased(GetParam()); }

    [[nodiscard]] static double wanted() { return GetParam() ? 4.5 : 3.0; }

    static void expectClear(ToolPanelButton &button, const char *state)
    {
        const Shape shape(button);
        const std::string name = button.identifier().toStdString() + ", " + state;
        EXPECT_FALSE(shape.isEmpty()) << name;
        EXPECT_GE(shape.contrastOfEdge(), wanted()) << name;
    }
};

std::string settingName(const testing::TestParamInfo<bool> &isIncreased)
{
    return isIncreased.param ? "increased" : "normal";
}

} // namespace

TEST_P(ToolImageContrast, toolsAreClearInEveryState)
{
    for (const QString &name : toolNames()) {
        ToolPanelButton &each = *bar.button(name);
        each.setEnabled(true);
        if (name != QStringLiteral("state")) {
            each.setIsSelected(false);
            each.toggleToolState();
        }
        expectClear(each, "normal");
        each.mouseEntered();
        expectClear(each, "hovered");
        each.mouseExited();
        expectClear(each, "left");
        if (name == QStringLiteral("state"))
            continue;
        each.setIsSelected(true);
        each.toggleToolState();
        expectClear(each, "selected");
        each.mouseExited();
        expectClear(each, "selected and left");
    }
}

TEST_P(ToolImageContrast, optionsAreClearInEveryState)
{
    for (ToolOptionsButton *const each : options()) {
        each->setIsSelected(false);
        each->toggleToolState();
        expectClear(*each, "normal");
        each->mouseEntered();
        expectClear(*each, "hovered");
        each->mouseExited();
        each->setIsSelected(true);
        each->toggleToolState();
        expectClear(*each, "selected");
    }
}

TEST_P(ToolImageContrast, colourButtonIsClearInEveryColour)
{
    for (ToolOptionsButton *const each : options()) {
        if (!each->identifier().startsWith(QLatin1String("color#")))
            continue;
        bar.changeColorToolImage(each->identifier());
        button("color").setIsSelected(false);
        button("color").toggleToolState();
        expectClear(button("color"), each->identifier().toLatin1().constData());
        button("color").mouseEntered();
        expectClear(button("color"), each->identifier().toLatin1().constData());
    }
}

TEST_P(ToolImageContrast, triangleIsClearButOnTheHoverColour)
{
    ToolPanelButton &brush = button("brush");
    brush.setIsSelected(false);
    brush.toggleToolState();
    EXPECT_GE(contrast(brush.setArrowColor().rgb(), brush.backgroundColor().rgb()), wanted());

    brush.mouseEntered();
    const double hovered = contrast(brush.setArrowColor().rgb(), brush.backgroundColor().rgb());
    if (GetParam())
        EXPECT_GE(hovered, wanted());
    else
        EXPECT_NEAR(hovered, 2.66, 0.01);
}

INSTANTIATE_TEST_SUITE_P(Settings, ToolImageContrast, testing::Bool(), settingName);

TEST(Contrast, isOneToTwentyOne)
{
    EXPECT_DOUBLE_EQ(contrast(qRgb(9, 9, 9), qRgb(9, 9, 9)), 1.0);
    EXPECT_DOUBLE_EQ(contrast(qRgb(0, 0, 0), qRgb(255, 255, 255)), 21.0);
    EXPECT_NEAR(contrast(qRgb(41, 41, 41), qRgb(246, 248, 250)), 13.7, 0.05);
    EXPECT_NEAR(contrast(qRgb(41, 41, 41), qRgb(18, 168, 241)), 5.5, 0.05);
    EXPECT_NEAR(contrast(qRgb(255, 255, 255), qRgb(7, 69, 149)), 9.2, 0.05);
}

} // namespace penwick::test
