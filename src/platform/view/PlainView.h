// SPDX-License-Identifier: MIT
// A view with nothing of its own: what a scene groups others with.
#pragma once

#include "platform/view/ViewOf.h"

#include <QWidget>

namespace penwick::platform {

/// Shows its layer and its subviews, and leaves the pointer to the view around it.
class PlainView final : public ViewOf<QWidget>
{
    Q_OBJECT

public:
    explicit PlainView(QWidget *parent = nullptr)
        : ViewOf(parent)
    { }
};

} // namespace penwick::platform
