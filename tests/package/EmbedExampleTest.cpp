// SPDX-License-Identifier: MIT
// The example outside the tree, built against what was installed and run.
#include "package/InstalledPackage.h"

#include <gtest/gtest.h>

#include <QDir>
#include <QFile>
#include <QProcess>

namespace penwick::test {

namespace {

const char *const wholeTour = "whiteboard: opened\n"
                              "whiteboard: ended\n"
                              "annotation: opened\n"
                              "annotation: ended\n"
                              "imageAnnotation: opened\n"
                              "imageAnnotation: ended\n";

class EmbedExample : public testing::Test
{
protected:
    void SetUp() override { ASSERT_EQ(package.complaint().toStdString(), ""); }

    // The sources in a folder of their own: nothing of the tree is in reach.
    [[nodiscard]] QString copyOfTheSources(const QString &folder) const
    {
        const QDir from(QStringLiteral(PENWICK_SOURCE_TREE "/examples/embed"));
        QString to = package.newFolder(folder);
        for (const QString &name : from.entryList(QDir::Files))
            EXPECT_TRUE(QFile::copy(from.filePath(name), to + QLatin1Char('/') + name));
        return to;
    }

    // Runs the example and looks at all that it says.
    static void expectTheWholeTour(const QString &program, const QProcessEnvironment &environment)
    {
        const Ending ending = run(program, { QStringLiteral("--offscreen") }, environment);

        EXPECT_EQ(ending.status, 0) << ending.errors.toStdString();
        const QString greeting = ending.output.section(QLatin1Char('\n'), 0, 0);
        EXPECT_EQ(
            greeting.section(QLatin1Char(' '), 0, 1).toStdString(), "Penwick " PENWICK_VERSION);
        EXPECT_EQ(ending.output.section(QLatin1Char('\n'), 1).toStdString(), wholeTour);
    }

    const InstalledPackage &package = InstalledPackage::shared();
};

void expectSuccess(const Ending &ending)
{
    ASSERT_EQ(ending.status, 0) << ending.output.toStdString() << ending.errors.toStdString();
}

QString text(const char *start, const QString &end)
{
    return QString::fromLatin1(start) + end;
}

} // namespace

TEST_F(EmbedExample, builtWithCMakeOpensEachKindOfWindowAndHearsItsEnd)
{
    const QString sources = copyOfTheSources(QStringLiteral("with-cmake"));
    const QString build = sources + QStringLiteral("/build");
    const QString cmake = QStringLiteral(PENWICK_CMAKE);

    ASSERT_NO_FATAL_FAILURE(expectSuccess(run(cmake,
        { QStringLiteral("-S"), sources, QStringLiteral("-B"), build, QStringLiteral("-G"),
            QStringLiteral(PENWICK_GENERATOR), text("-DCMAKE_PREFIX_PATH=", package.prefix()),
            QStringLiteral("-DCMAKE_BUILD_TYPE=" PENWICK_CONFIGURATION),
            QStringLiteral("-DCMAKE_CXX_COMPILER=" PENWICK_COMPILER),
            QStringLiteral("-DCMAKE_CXX_FLAGS=" PENWICK_STRANGER_FLAGS) })));
    ASSERT_NO_FATAL_FAILURE(expectSuccess(run(cmake, { QStringLiteral("--build"), build })));

    expectTheWholeTour(
        build + QStringLiteral("/penwick-embed"), QProcessEnvironment::systemEnvironment());
}

TEST_F(EmbedExample, builtWithPkgConfigOpensEachKindOfWindowAndHearsItsEnd)
{
    const QString sources = copyOfTheSources(QStringLiteral("with-pkg-config"));
    const QString program = sources + QStringLiteral("/penwick-embed");
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.insert(
        QStringLiteral("PKG_CONFIG_PATH"), package.libraryFolder() + QStringLiteral("/pkgconfig"));
    const Ending flags = run(QStringLiteral(PENWICK_PKG_CONFIG),
        { QStringLiteral("--cflags"), QStringLiteral("--libs"), QStringLiteral("penwick") },
        environment);
    ASSERT_NO_FATAL_FAILURE(expectSuccess(flags));

    QStringList arguments { QStringLiteral("-std=c++20"), QStringLiteral("-fPIC"),
        sources + QStringLiteral("/Tour.cpp"), sources + QStringLiteral("/main.cpp"),
        QStringLiteral("-o"), program };
    arguments += QProcess::splitCommand(
        QStringLiteral(PENWICK_STRANGER_FLAGS " ") + flags.output.trimmed());
    ASSERT_NO_FATAL_FAILURE(expectSuccess(run(QStringLiteral(PENWICK_COMPILER), arguments)));

    // Nobody put the library where the system looks.
    environment.insert(QStringLiteral("LD_LIBRARY_PATH"), package.libraryFolder());
    expectTheWholeTour(program, environment);
}

} // namespace penwick::test
