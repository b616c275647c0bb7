// SPDX-License-Identifier: MIT
// An installed Penwick, and running what a stranger would run on it.
#pragma once

#include <QProcessEnvironment>
#include <QString>
#include <QStringList>
#include <QTemporaryDir>

namespace penwick::test {

/// How a program ended.
struct Ending
{
    int status = -1; ///< -1: it could not be started, crashed, or ran out of time
    QString output;
    QString errors;
};

/// Runs `program` to its end, at most four minutes.
[[nodiscard]] Ending run(const QString &program, const QStringList &arguments,
    const QProcessEnvironment &environment = QProcessEnvironment::systemEnvironment());

/// Penwick as `cmake --install` leaves it, in a folder of its own that goes with this object.
///
/// Installed to one prefix and then moved to another: who unpacks a package somewhere else does
/// the same.
class InstalledPackage final
{
public:
    /// The one that all tests look at; installed on first use.
    [[nodiscard]] static const InstalledPackage &shared();

    /// Empty where everything went well; otherwise what was said about it.
    [[nodiscard]] const QString &complaint() const { return m_complaint; }
    [[nodiscard]] QString prefix() const;
    [[nodiscard]] QString libraryFolder() const;
    /// Every file and link under the prefix, relative to it, in order of their names.
    [[nodiscard]] QStringList files() const;
    /// A new empty folder beside the prefix.
    [[nodiscard]] QString newFolder(const QString &name) const;

private:
    InstalledPackage();

    QTemporaryDir m_folder;
    QString m_complaint;
};

/// Every file under `folder`, relative to it, in order of their names.
[[nodiscard]] QStringList filesUnder(const QString &folder);

} // namespace penwick::test
