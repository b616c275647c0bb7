// SPDX-License-Identifier: MIT
// Resources by name.
#include "platform/scene/Bundle.h"

#include "platform/SvgFile.h"

#include <QPixmap>

#include <gtest/gtest.h>

namespace penwick::platform {

TEST(Bundle, imageIsFoundByItsNameWithoutAnEnding)
{
    const SvgFile artwork(20, 10);
    const Bundle bundle(artwork.folder());

    const QIcon icon = bundle.imageForResource(QStringLiteral("Artwork"));

    EXPECT_FALSE(icon.isNull());
    EXPECT_EQ(icon.actualSize(QSize(128, 128)), QSize(20, 10));
}

TEST(Bundle, nameThatIsNotThereGivesANullImage)
{
    const SvgFile artwork(20, 10);
    const Bundle bundle(artwork.folder());

    EXPECT_TRUE(bundle.imageForResource(QStringLiteral("Artwork.svg")).isNull());
    EXPECT_TRUE(bundle.imageForResource(QStringLiteral("artwork")).isNull());
    EXPECT_TRUE(bundle.imageForResource(QString()).isNull());
}

TEST(Bundle, sceneIsFoundByStoryboardAndIdentifier)
{
    Bundle bundle((QString()));
    bundle.addScene(QStringLiteral("Main"), QStringLiteral("Scene"),
        [] { return std::make_unique<QObject>(); });

    EXPECT_TRUE(bundle.scene(QStringLiteral("Main"), QStringLiteral("Scene")));
    EXPECT_FALSE(bundle.scene(QStringLiteral("Main"), QStringLiteral("Other")));
    EXPECT_FALSE(bundle.scene(QStringLiteral("Other"), QStringLiteral("Scene")));
}

} // namespace penwick::platform
