// SPDX-License-Identifier: MIT
// Where the desktop's increase-contrast setting is heard of.
#pragma once

#include <QObject>

#include <memory>

namespace penwick::platform {

/// Tells what the desktop's user has set. Until it has told, contrast is normal. GUI thread only.
class ContrastSource : public QObject
{
    Q_OBJECT

public:
    ~ContrastSource() override;

Q_SIGNALS:
    /// The setting as the desktop has it now; perhaps what it was before. Sent from the event
    /// loop.
    void told(bool isIncreased);

protected:
    explicit ContrastSource(QObject *parent = nullptr);
};

/// That of this build's platform, which connects in the background; null where none is known.
/// There is one for the process.
std::unique_ptr<ContrastSource> makeContrastSource();

} // namespace penwick::platform
