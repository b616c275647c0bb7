// SPDX-License-Identifier: MIT
#include "platform/native/ContrastSource.h"

namespace penwick::platform {

ContrastSource::ContrastSource(QObject *parent)
    : QObject(parent)
{ }

ContrastSource::~ContrastSource() = default;

} // namespace penwick::platform
