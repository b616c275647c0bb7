// SPDX-License-Identifier: MIT
// A still image in the corner from which drawings count.
#include "platform/ImageView.h"

#include <gtest/gtest.h>

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

TEST(ImageView, imageThatIsLargerIsCutAtTheTopAndRight)
{
    ImageView view;
    view.setFrame({ 0.0, 0.0, 40.0, 30.0 });

    view.setImage(plain(100, 100));

    EXPECT_EQ(shown(view), QRect(0, 0, 40, 30));
}

} // namespace penwick::platform
