// SPDX-License-Identifier: MIT
#include "history/SubviewOperation.h"

#include <QMetaType>
#include <QString>

namespace penwick {

namespace {

using Case = SubviewOperation::Case;

QString nameOf(Case operation)
{
    switch (operation) {
    case Case::removeWithId:
        return QStringLiteral("removeWithId");
    case Case::removefirst:
        return QStringLiteral("removefirst");
    case Case::removelast:
        return QStringLiteral("removelast");
    case Case::removeall:
        return QStringLiteral("removeall");
    }
    return {};
}

std::optional<SubviewOperation> fromMap(const QVariantMap &map)
{
    const QVariant identifier = map.value(nameOf(Case::removeWithId));
    if (map.size() != 1 || identifier.typeId() != QMetaType::LongLong)
        return std::nullopt;
    return SubviewOperation::removeWithId(identifier.toLongLong());
}

std::optional<SubviewOperation> fromName(const QString &name)
{
    for (const Case operation : { Case::removefirst, Case::removelast, Case::removeall }) {
        if (name == nameOf(operation))
            return SubviewOperation { operation, 0 };
    }
    return std::nullopt;
}

} // namespace

QVariant SubviewOperation::toVariant() const
{
    if (operation != Case::removeWithId)
        return nameOf(operation);
    return QVariantMap { { nameOf(operation), QVariant::fromValue<qlonglong>(identifier) } };
}

std::optional<SubviewOperation> SubviewOperation::fromVariant(const QVariant &object)
{
    if (object.typeId() == QMetaType::QVariantMap)
        return fromMap(object.toMap());
    if (object.typeId() == QMetaType::QString)
        return fromName(object.toString());
    return std::nullopt;
}

} // namespace penwick
