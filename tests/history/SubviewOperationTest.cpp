// SPDX-License-Identifier: MIT
// There and back through the notification's object, and what is no such object.
#include "history/SubviewOperation.h"

#include <gtest/gtest.h>

#include <limits>

namespace penwick::test {
namespace {

using Case = SubviewOperation::Case;

TEST(SubviewOperation, removalByIdentifierTravelsAsAMapOfOneEntry)
{
    const std::int64_t identifier = std::numeric_limits<std::int64_t>::min();

    const QVariant object = SubviewOperation::removeWithId(identifier).toVariant();

    EXPECT_EQ(object,
        QVariant(QVariantMap { { QStringLiteral("removeWithId"), qlonglong { identifier } } }));
    EXPECT_EQ(SubviewOperation::fromVariant(object),
        (SubviewOperation { Case::removeWithId, identifier }));
}

TEST(SubviewOperation, otherCasesTravelAsTheirNames)
{
    const std::pair<Case, QString> names[] = {
        { Case::removefirst, QStringLiteral("removefirst") },
        { Case::removelast, QStringLiteral("removelast") },
        { Case::removeall, QStringLiteral("removeall") },
    };

    for (const auto &[operation, name] : names) {
        EXPECT_EQ((SubviewOperation { operation, 0 }).toVariant(), QVariant(name));
        EXPECT_EQ(SubviewOperation::fromVariant(name), (SubviewOperation { operation, 0 }));
    }
}

class NoSubviewOperation : public ::testing::TestWithParam<QVariant>
{ };

TEST_P(NoSubviewOperation, yieldsNothing)
{
    EXPECT_EQ(SubviewOperation::fromVariant(GetParam()), std::nullopt);
}

INSTANTIATE_TEST_SUITE_P(SubviewOperation, NoSubviewOperation,
    ::testing::Values(QVariant(), QVariant(7), QVariant(qlonglong { 7 }),
        QVariant(QStringLiteral("removeWithId")), QVariant(QStringLiteral("removeFirst")),
        QVariant(QString()), QVariant(QByteArray("removeall")), QVariant(QVariantMap()),
        QVariant(QVariantMap { { QStringLiteral("removeWithId"), QStringLiteral("7") } }),
        QVariant(QVariantMap { { QStringLiteral("removeall"), qlonglong { 7 } } }),
        QVariant(QVariantMap { { QStringLiteral("removeWithId"), qlonglong { 7 } },
            { QStringLiteral("enableUndo"), true } })));

} // namespace
} // namespace penwick::test
