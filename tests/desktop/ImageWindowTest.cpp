// SPDX-License-Identifier: MIT
// The layer over a still image: how large its window is, and where the image lies in it.
#include "desktop/support/BoardFixture.h"

#include <algorithm>
#include <cmath>

namespace penwick::desktop {

namespace {

constexpr QColor photoFrame { 128, 128, 128 };

class ImageWindow : public BoardUnderEachManager
{
protected:
    static constexpr int border = 3;

    /// A picture in which no two places near each other look the same.
    static QImage pictureOf(QSize size)
    {
        QImage image(size, QImage::Format_RGB32);
        for (int y = 0; y < image.height(); ++y) {
            for (int x = 0; x < image.width(); ++x)
                image.setPixel(x, y, qRgb(x % 256, y % 256, (x / 256) * 40 + (y / 256) * 20 + 60));
        }
        return image;
    }

    void startOn(const QImage &image, const std::vector<std::string> &others = {})
    {
        const std::string file = desktop().file("picture.png");
        ASSERT_TRUE(image.save(QString::fromStdString(file)));
        std::vector<std::string> arguments { "--window", "imageAnnotation", "--image", file };
        arguments.insert(arguments.end(), others.begin(), others.end());
        start(arguments);
        static_cast<void>(toolBar());
    }

    /// `image` as the window shows it: all of it, never larger than it is.
    [[nodiscard]] QImage shown(const QImage &image)
    {
        const QSize room = canvas().size();
        const double scale = std::min(
            { 1.0, double(room.width()) / image.width(), double(room.height()) / image.height() });
        return image.scaled((QSizeF(image.size()) * scale).toSize(), Qt::IgnoreAspectRatio,
            Qt::SmoothTransformation);
    }

    /// Where on the screen the top left corner of what is shown must lie: its bottom left one is
    /// the canvas's.
    [[nodiscard]] QPoint cornerOf(const QImage &image)
    {
        return canvas().bottomLeft() - QPoint(0, image.height() - 1);
    }

    /// The part of the canvas where nothing lies over the image.
    [[nodiscard]] QRect clearArea()
    {
        QRect area = canvas().adjusted(border, border, -border, -border);
        area.setLeft(toolBar().frame.right() + 10);
        return area;
    }

    [[nodiscard]] bool comesToShow(const QImage &image)
    {
        const QRect area
            = clearArea() & QRect(cornerOf(image), image.size()).adjusted(1, 1, -1, -1);
        return waitUntil([&] {
            return desktop().screen().picture(area)
                == image.copy(area.translated(-cornerOf(image)))
                       .convertToFormat(QImage::Format_RGB32);
        });
    }
};

} // namespace

TEST_P(ImageWindow, outerFrameIsAsLargeAsTheImage)
{
    startOn(pictureOf({ 600, 400 }));

    // A sixth of the screen from its left and bottom edges.
    EXPECT_EQ(desktop().windows().outerFrame(window()), QRect(213, 267, 600, 400));
    EXPECT_EQ(host().window(QStringLiteral("drawing")).frame, QRect(213, 267, 600, 400));
}

TEST_P(ImageWindow, wholeImageLiesInTheCanvassBottomLeftCorner)
{
    const QImage image = pictureOf({ 600, 400 });
    startOn(image);
    ASSERT_EQ(shown(image).height(), canvas().height()) << "the title bar leaves no more room";

    EXPECT_TRUE(comesToShow(shown(image)));
}

TEST_P(ImageWindow, largerThanTheScreenIsBroughtInsideWithItsTitleBarAndTheWholeImage)
{
    const QRect screen(0, 0, 1280, 800);
    for (const QSize size : { QSize(3000, 2000), QSize(1280, 800), QSize(1281, 801),
             QSize(300, 2400), QSize(3000, 300) }) {
        const QImage image = pictureOf(size);
        startOn(image);
        const QRect frame = desktop().windows().outerFrame(window());

        EXPECT_TRUE(screen.contains(frame)) << testing::PrintToString(frame);
        const QSize wanted = size.boundedTo(screen.size()) == size
            ? size
            : size.scaled(1280, 800, Qt::KeepAspectRatio);
        EXPECT_LE(std::abs(frame.width() - wanted.width()), 1) << testing::PrintToString(frame);
        EXPECT_LE(std::abs(frame.height() - wanted.height()), 1) << testing::PrintToString(frame);
        EXPECT_GT(canvas().top(), frame.top()) << "its title bar is within reach";
        EXPECT_TRUE(screen.contains(toolBar().frame));
        EXPECT_TRUE(comesToShow(shown(image))) << testing::PrintToString(size);
    }
}

TEST_P(ImageWindow, hasTheTitleThatTheHostGave)
{
    startOn(pictureOf({ 600, 400 }), { "--title", "A captured frame" });
    EXPECT_EQ(desktop().windows().title(window()), QStringLiteral("A captured frame"));
}

TEST_P(ImageWindow, withoutATitleHasTheBoards)
{
    startOn(pictureOf({ 600, 400 }));
    EXPECT_EQ(desktop().windows().title(window()), QStringLiteral("Tarnhill Whiteboard"));
}

TEST_P(ImageWindow, strokeLiesOverTheImage)
{
    QImage image(600, 400, QImage::Format_RGB32);
    image.fill(QColor(200, 100, 0));
    startOn(image);
    ASSERT_TRUE(comesToShow(shown(image)));

    drag({ { 200, 150 }, { 400, 150 } });

    const auto seen = [this] { return desktop().screen().pixel(onScreen({ 300, 150 })); };
    const QColor wanted(89, 59, 29); // (41, 41, 41) at alpha 0.7
    EXPECT_TRUE(waitUntil([&] {
        return std::abs(seen().red() - wanted.red()) <= 1
            && std::abs(seen().green() - wanted.green()) <= 1
            && std::abs(seen().blue() - wanted.blue()) <= 1;
    }));
}

TEST_P(ImageWindow, keepsTheImageInItsCornerWhenTheUserMakesItLargerAndShowsThePhotosFrame)
{
    const QImage whole = pictureOf({ 480, 270 });
    startOn(whole);
    const QImage image = shown(whole);
    const QRect before = desktop().windows().outerFrame(window());

    pull(gripOf(before, { 1, 1 }), { 160, 90 });

    ASSERT_TRUE(waitUntil([&] { return canvas().width() > 600; }));
    const auto frame
        = [&](QPoint fromCorner) { return desktop().screen().pixel(cornerOf(image) + fromCorner); };
    EXPECT_TRUE(waitUntil([&] { return frame({ image.width() - 1, 150 }) == photoFrame; }));
    EXPECT_EQ(frame({ 300, 0 }), photoFrame);
    EXPECT_EQ(frame({ image.width(), 150 }), QColor(Qt::white));
    EXPECT_EQ(frame({ 300, -1 }), QColor(Qt::white));
    const QRect inside = clearArea() & QRect(cornerOf(image), image.size()).adjusted(1, 1, -1, -1);
    EXPECT_EQ(desktop().screen().picture(inside), image.copy(inside.translated(-cornerOf(image))));
}

INSTANTIATE_TEST_SUITE_P(
    WindowManagers, ImageWindow, testing::ValuesIn(eachManager()), managerName);

} // namespace penwick::desktop
