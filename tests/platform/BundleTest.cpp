// SPDX-License-Identifier: MIT
// Resources by name: artwork, and scenes, a missing one and one of another class.
#include "platform/scene/Bundle.h"

#include "platform/SvgFile.h"

#include <QPixmap>
#include <QTimer>
#include <QWindow>

#include <gtest/gtest.h>

namespace penwick::platform {

namespace {

const auto storyboard = QStringLiteral("Main");
const auto identifier = QStringLiteral("Scene");

/// A bundle with one scene, which holds a QTimer.
Bundle bundleWithATimer(int &made)
{
    Bundle bundle((QString()));
    bundle.addScene(storyboard, identifier, [&made] {
        ++made;
        return std::make_unique<QTimer>();
    });
    return bundle;
}

} // namespace

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

TEST(Bundle, everyInstanceOfASceneIsANewOne)
{
    int made = 0;
    const Bundle bundle = bundleWithATimer(made);

    const auto first = bundle.instantiate<QTimer>(storyboard, identifier);
    const auto second = bundle.instantiate<QTimer>(storyboard, identifier);

    EXPECT_TRUE(first);
    EXPECT_TRUE(second);
    EXPECT_NE(first, second);
    EXPECT_EQ(made, 2);
}

TEST(Bundle, missingSceneGivesNothing)
{
    int made = 0;
    const Bundle bundle = bundleWithATimer(made);
    const auto other = QStringLiteral("Other");

    EXPECT_FALSE(bundle.instantiateController(storyboard, other));
    EXPECT_FALSE(bundle.instantiateController(other, identifier));
    EXPECT_EQ(made, 0);
}

TEST(Bundle, sceneOfAnotherClassIsThereAndIsNotGivenAsTheWrongOne)
{
    int made = 0;
    const Bundle bundle = bundleWithATimer(made);

    const auto asWindow = bundle.instantiate<QWindow>(storyboard, identifier);
    const auto asItIs = bundle.instantiateController(storyboard, identifier);

    EXPECT_FALSE(asWindow);
    EXPECT_TRUE(asItIs);
    EXPECT_EQ(made, 2);
}

} // namespace penwick::platform
