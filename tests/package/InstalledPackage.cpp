// SPDX-License-Identifier: MIT
#include "package/InstalledPackage.h"

#include <QDir>
#include <QDirIterator>
#include <QProcess>

namespace penwick::test {

Ending run(
    const QString &program, const QStringList &arguments, const QProcessEnvironment &environment)
{
    constexpr int bound = 240'000; // milliseconds
    QProcess process;
    process.setProcessEnvironment(environment);
    process.start(program, arguments);
    Ending ending;
    if (process.waitForFinished(bound) && process.exitStatus() == QProcess::NormalExit)
        ending.status = process.exitCode();
    ending.output = QString::fromLocal8Bit(process.readAllStandardOutput());
    ending.errors = QString::fromLocal8Bit(process.readAllStandardError());
    return ending;
}

QStringList filesUnder(const QString &folder)
{
    QStringList files;
    QDirIterator walk(folder, QDir::Files | QDir::System | QDir::Hidden | QDir::NoDotAndDotDot,
        QDirIterator::Subdirectories);
    while (walk.hasNext())
        files.append(QDir(folder).relativeFilePath(walk.next()));
    files.sort();
    return files;
}

InstalledPackage::InstalledPackage()
{
    const QString first = m_folder.filePath(QStringLiteral("first"));
    const Ending ending = run(QStringLiteral(PENWICK_CMAKE),
        { QStringLiteral("--install"), QStringLiteral(PENWICK_BUILD_TREE),
            QStringLiteral("--config"), QStringLiteral(PENWICK_CONFIGURATION),
            QStringLiteral("--prefix"), first });
    if (ending.status != 0)
        m_complaint = QStringLiteral("cmake --install failed: ") + ending.output + ending.errors;
    else if (!QDir().rename(first, prefix()))
        m_complaint = QStringLiteral("what was installed cannot be moved");
}

const InstalledPackage &InstalledPackage::shared()
{
    static const InstalledPackage package;
    return package;
}

QString InstalledPackage::prefix() const
{
    return m_folder.filePath(QStringLiteral("prefix"));
}

QString InstalledPackage::libraryFolder() const
{
    return prefix() + QStringLiteral("/" PENWICK_LIBRARY_FOLDER);
}

QStringList InstalledPackage::files() const
{
    return filesUnder(prefix());
}

QString InstalledPackage::newFolder(const QString &name) const
{
    QDir(m_folder.path()).mkdir(name);
    return m_folder.filePath(name);
}

} // namespace penwick::test
