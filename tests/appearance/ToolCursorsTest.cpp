// SPDX-License-Identifier: MIT
// Cursors by the names of their images.
#include "appearance/ToolCursors.h"

#include "appearance/PenwickBundle.h"

#include <QFile>
#include <QPixmap>
#include <QTemporaryDir>

#include <gtest/gtest.h>

#include <memory>
#include <ostream>
#include <string>

namespace penwick::test {

namespace {

const auto artwork = QStringLiteral(":/penwick/images");

/// Sets a bundle with the component's artwork, and none again afterwards.
class ToolCursors : public testing::Test
{
protected:
    ToolCursors() { setPenwickBundle(std::make_shared<platform::Bundle>(artwork)); }
    ~ToolCursors() override { setPenwickBundle(nullptr); }
};

using ToolCursorsDeathTest = ToolCursors;

struct NamedHotSpot
{
    const char *name;
    platform::Point hotSpot;

    friend std::ostream &operator<<(std::ostream &stream, const NamedHotSpot &named)
    {
        return stream << named.name;
    }
};

class ToolCursor : public ToolCursors, public testing::WithParamInterface<NamedHotSpot>
{ };

} // namespace

TEST_P(ToolCursor, hasItsImageAndItsHotSpot)
{
    const platform::Cursor cursor = getCursorOfType(QString::fromLatin1(GetParam().name));

    EXPECT_EQ(cursor.hotSpot(), GetParam().hotSpot);
    EXPECT_FALSE(cursor.image().isNull());
    const QCursor shown = cursor.forScale(1.0);
    EXPECT_TRUE(shown.pixmap().rect().contains(shown.hotSpot())) << "it could not be clicked with";
}

INSTANTIATE_TEST_SUITE_P(ToolCursors, ToolCursor,
    testing::Values(NamedHotSpot { "Text_Cursor", { 10.0, 10.0 } },
        NamedHotSpot { "Brush_Cursor", { 0.0, 20.0 } },
        NamedHotSpot { "Eraser_Cursor", { 0.0, 20.0 } },
        NamedHotSpot { "Move_Cursor", { 12.0, 12.0 } }),
    [](const auto &named) { return std::string(named.param.name); });

TEST_F(ToolCursors, everyCallMakesANewCursor)
{
    const auto name = QStringLiteral("Brush_Cursor");

    EXPECT_FALSE(getCursorOfType(name) == getCursorOfType(name));
}

TEST_F(ToolCursors, otherImageIsACursorWithItsHotSpotInTheCorner)
{
    const QTemporaryDir folder;
    ASSERT_TRUE(QFile::copy(artwork + QStringLiteral("/Text_Cursor.svg"),
        folder.filePath(QStringLiteral("text_cursor.svg"))));
    setPenwickBundle(std::make_shared<platform::Bundle>(folder.path()));

    const platform::Cursor cursor = getCursorOfType(QStringLiteral("text_cursor"));

    EXPECT_EQ(cursor.hotSpot(), (platform::Point { 0.0, 0.0 }));
    EXPECT_FALSE(cursor.image().isNull());
}

TEST_F(ToolCursorsDeathTest, nameWithoutAnImageStopsTheProcess)
{
    EXPECT_DEATH(static_cast<void>(getCursorOfType(QStringLiteral("Pen_Cursor"))),
        "penwick: fatal error: a cursor image is missing");
}

TEST_F(ToolCursorsDeathTest, missingBundleStopsTheProcess)
{
    setPenwickBundle(nullptr);

    EXPECT_DEATH(static_cast<void>(getCursorOfType(QStringLiteral("Text_Cursor"))),
        "penwick: fatal error: the resource bundle is not set");
}

} // namespace penwick::test
