// SPDX-License-Identifier: MIT
// A still image in the corner from which drawings count.
#include "platform/view/ImageView.h"

#include <QPainter>

#include <gtest/gtest.h>

#include <utility>
#include <vector>

namespace penwick::platform {

namespace {

QImage plain(int width, int height, double scale = 1.0)
{
    QImage image(width, height, QImage::Format_RGB32);
    image.fill(Qt::red);
    image.setDevicePixelRatio(scale);
    return image;
}

/// The part of the view that is red.
QRect shown(ImageView &view)
{
    QImage picture(view.size(), QImage::Format_ARGB32_Premultiplied);
    picture.fill(Qt::transparent);
    view.render(&picture, QPoint(), QRegion(), QWidget::RenderFlags());
    QRect found;
    for (int y = 0; y < picture.height(); ++y) {
        for (int x = 0; x < picture.width(); ++x) {
            if (picture.pixelColor(x, y) == QColor(Qt::red))
                found |= QRect(x, y, 1, 1);
        }
    }
    return found;
}

} // namespace

TEST(ImageView, newOneShowsNothing)
{
    ImageView view;
    view.setFrame({ 0.0, 0.0, 40.0, 30.0 });

    EXPECT_TRUE(view.image().isNull());
    EXPECT_EQ(shown(view), QRect());
}

TEST(ImageView, imageLiesInTheBottomLeftCornerAtItsOwnSize)
{
    ImageView view;
    view.setFrame({ 0.0, 0.0, 40.0, 30.0 });

    view.setImage(plain(10, 5));

    EXPECT_EQ(shown(view), QRect(0, 25, 10, 5));
}

TEST(ImageView, imageOfTwoPixelsAPointIsHalfAsLarge)
{
    ImageView view;
    view.setFrame({ 0.0, 0.0, 40.0, 30.0 });

    view.setImage(plain(20, 10, 2.0));

    EXPECT_EQ(shown(view), QRect(0, 25, 10, 5));
}

TEST(ImageView, imageThatIsLargerIsScaledDownInItsOwnShape)
{
    ImageView view;
    view.setFrame({ 0.0, 0.0, 40.0, 30.0 });

    view.setImage(plain(100, 100));
    EXPECT_EQ(shown(view), QRect(0, 0, 30, 30));
    view.setImage(plain(200, 50));
    EXPECT_EQ(shown(view), QRect(0, 20, 40, 10));
    view.setFrame({ 0.0, 0.0, 20.0, 30.0 });
    EXPECT_EQ(shown(view), QRect(0, 25, 20, 5));
    view.setFrame({ 0.0, 0.0, 300.0, 60.0 });
    EXPECT_EQ(shown(view), QRect(0, 10, 200, 50)) << "at its own size again";
}

TEST(ImageView, imageThatIsScaledDownIsSeenWhole)
{
    QImage image(80, 40, QImage::Format_RGB32);
    image.fill(Qt::white);
    const std::vector<std::pair<QPoint, QColor>> corners { { { 0, 0 }, Qt::red },
        { { 40, 0 }, Qt::green }, { { 0, 20 }, Qt::blue }, { { 40, 20 }, Qt::black } };
    QPainter painter(&image);
    for (const auto &[place, color] : corners)
        painter.fillRect(QRect(place, QSize(40, 20)), color);
    painter.end();
    ImageView view;
    view.setFrame({ 0.0, 0.0, 20.0, 10.0 });
    view.setImage(image);

    QImage picture(20, 10, QImage::Format_RGB32);
    view.render(&picture, QPoint(), QRegion(), QWidget::RenderFlags());

    for (const auto &[place, color] : corners) {
        EXPECT_EQ(picture.pixelColor(place / 4), color);
        EXPECT_EQ(picture.pixelColor(place / 4 + QPoint(8, 3)), color);
    }
}

} // namespace penwick::platform
