// SPDX-License-Identifier: MIT
#include "support/NotificationRecorder.h"

#include "history/NotificationNames.h"
#include "history/SubviewOperation.h"

#include <penwick/platform/NotificationCenter.h>

#include <optional>
#include <utility>

namespace penwick::test {

namespace {

std::optional<std::string> buttonState(const QVariant &object)
{
    const QVariantMap map = object.toMap();
    if (object.typeId() != QMetaType::QVariantMap || map.size() != 1)
        return std::nullopt;
    const QString &key = map.firstKey();
    const QVariant &value = map.first();
    const bool isKnown = key == QStringLiteral("enableUndo") || key == QStringLiteral("enableRedo");
    if (!isKnown || value.typeId() != QMetaType::Bool)
        return std::nullopt;
    return key.toStdString() + (value.toBool() ? " true" : " false");
}

std::optional<std::string> subviewOperation(const QVariant &object)
{
    const auto operation = SubviewOperation::fromVariant(object);
    if (!operation)
        return std::nullopt;
    if (operation->operation == SubviewOperation::Case::removeWithId)
        return "removeWithId " + std::to_string(operation->identifier);
    return object.toString().toStdString();
}

std::optional<std::string> inWords(const platform::Notification &notification)
{
    if (notification.name == penwickNotificationKey())
        return buttonState(notification.object);
    if (notification.name == drawingCanvasSubviewUpdateNotification())
        return subviewOperation(notification.object);
    if (notification.name == drawingViewUpdatedNotification() && !notification.object.isValid())
        return "redraw";
    return std::nullopt;
}

} // namespace

NotificationRecorder::NotificationRecorder()
{
    platform::NotificationCenter::defaultCenter().addObserver(
        this, QString(), [this](const platform::Notification &notification) {
            m_posted.push_back(
                inWords(notification).value_or("? " + notification.name.toStdString()));
        });
}

NotificationRecorder::~NotificationRecorder()
{
    platform::NotificationCenter::defaultCenter().removeObserver(this);
}

std::vector<std::string> NotificationRecorder::take()
{
    return std::exchange(m_posted, {});
}

} // namespace penwick::test
