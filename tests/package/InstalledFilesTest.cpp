// SPDX-License-Identifier: MIT
// Which files are installed, and what they say about themselves.
#include "package/InstalledPackage.h"

#include <gtest/gtest.h>

#include <QFile>
#include <QRegularExpression>

namespace penwick::test {

namespace {

class InstalledFiles : public testing::Test
{
protected:
    void SetUp() override { ASSERT_EQ(package.complaint().toStdString(), ""); }

    const InstalledPackage &package = InstalledPackage::shared();
};

// One name a line, so that a failure shows the difference.
std::string lines(const QStringList &names)
{
    return names.join(QLatin1Char('\n')).toStdString();
}

QString inLibraryFolder(const char *name)
{
    return QStringLiteral(PENWICK_LIBRARY_FOLDER "/") + QString::fromLatin1(name);
}

QStringList publicHeaders()
{
    QStringList headers = filesUnder(QStringLiteral(PENWICK_SOURCE_TREE "/include"));
    headers.removeIf([](const QString &name) { return !name.endsWith(QStringLiteral(".h")); });
    headers.replaceInStrings(QRegularExpression(QStringLiteral("^")), QStringLiteral("include/"));
    return headers;
}

QByteArray contents(const QString &path)
{
    QFile file(path);
    EXPECT_TRUE(file.open(QIODevice::ReadOnly)) << path.toStdString();
    return file.readAll();
}

} // namespace

TEST_F(InstalledFiles, areTheLibraryThePublicHeadersAndTheTwoPackageDescriptions)
{
    const QString targets = QStringLiteral("cmake/Penwick/PenwickTargets-")
        + QStringLiteral(PENWICK_CONFIGURATION).toLower() + QStringLiteral(".cmake");
    QStringList expected = publicHeaders();
    expected += inLibraryFolder("libpenwick.so");
    expected += inLibraryFolder("libpenwick.so." PENWICK_SHORT_VERSION);
    expected += inLibraryFolder("libpenwick.so." PENWICK_VERSION);
    expected += inLibraryFolder("cmake/Penwick/PenwickConfig.cmake");
    expected += inLibraryFolder("cmake/Penwick/PenwickConfigVersion.cmake");
    expected += inLibraryFolder("cmake/Penwick/PenwickTargets.cmake");
    expected += inLibraryFolder(targets.toLatin1());
    expected += inLibraryFolder("pkgconfig/penwick.pc");
    expected.sort();

    EXPECT_EQ(lines(package.files()), lines(expected));
}

TEST_F(InstalledFiles, nameNoFolderOfTheMachineThatBuiltThem)
{
    for (const QString &name : package.files()) {
        if (name.contains(QStringLiteral(".so")))
            continue;
        const QByteArray text = contents(package.prefix() + QLatin1Char('/') + name);
        EXPECT_FALSE(text.contains(PENWICK_SOURCE_TREE)) << name.toStdString();
        EXPECT_FALSE(text.contains(PENWICK_BUILD_TREE)) << name.toStdString();
    }
}

TEST_F(InstalledFiles, libraryHasItsShortNameAndLooksForOthersOnlyWhereTheSystemDoes)
{
    const Ending ending = run(QStringLiteral(PENWICK_READELF),
        { QStringLiteral("-dW"), package.libraryFolder() + QStringLiteral("/libpenwick.so") });

    ASSERT_EQ(ending.status, 0) << ending.errors.toStdString();
    EXPECT_TRUE(ending.output.contains(
        QStringLiteral("Library soname: [libpenwick.so." PENWICK_SHORT_VERSION "]")));
    EXPECT_FALSE(ending.output.contains(QStringLiteral("(RPATH)")));
    EXPECT_FALSE(ending.output.contains(QStringLiteral("(RUNPATH)")));
}

TEST_F(InstalledFiles, pkgConfigTellsTheVersionOfTheLibrary)
{
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.insert(
        QStringLiteral("PKG_CONFIG_PATH"), package.libraryFolder() + QStringLiteral("/pkgconfig"));

    const Ending ending = run(QStringLiteral(PENWICK_PKG_CONFIG),
        { QStringLiteral("--modversion"), QStringLiteral("penwick") }, environment);

    EXPECT_EQ(ending.status, 0) << ending.errors.toStdString();
    EXPECT_EQ(ending.output.toStdString(), PENWICK_VERSION "\n");
}

} // namespace penwick::test
