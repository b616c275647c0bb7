// SPDX-License-Identifier: MIT
// What penwick-host answers to options: exit status, standard output and standard error.
#include "desktop/support/Printing.h"

#include <gtest/gtest.h>

#include <QColor>
#include <QFile>
#include <QImage>
#include <QProcess>
#include <QProcessEnvironment>
#include <QTemporaryDir>

#include <optional>
#include <ostream>

namespace {

struct Result
{
    int status = 0;
    QString output;
    QString errors;
};

// Runs the program to its end. `platform` stands for the display; the default has none and would
// stop the process, so a run that ends well has opened no window.
std::optional<Result> run(
    const QStringList &arguments, const QString &platform = QStringLiteral("no display"))
{
    constexpr int bound = 10'000; // milliseconds
    QProcess process;
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.insert(QStringLiteral("QT_QPA_PLATFORM"), platform);
    const QTemporaryDir runtimeFolder; // without one the toolkit complains on standard error
    environment.insert(QStringLiteral("XDG_RUNTIME_DIR"), runtimeFolder.path());
    process.setProcessEnvironment(environment);
    process.start(QStringLiteral(PENWICK_HOST_PROGRAM), arguments);
    if (!process.waitForFinished(bound) || process.exitStatus() != QProcess::NormalExit)
        return std::nullopt;
    return Result { process.exitCode(), QString::fromLocal8Bit(process.readAllStandardOutput()),
        QString::fromLocal8Bit(process.readAllStandardError()) };
}

struct Refusal
{
    const char *name;
    QStringList arguments;
    const char *line; ///< on standard error, without the line feed
};

void PrintTo(const Refusal &refusal, std::ostream *stream)
{
    *stream << refusal.arguments.join(QLatin1Char(' ')).toStdString();
}

QStringList words(const char *text)
{
    return QString::fromLatin1(text).split(QLatin1Char(' '));
}

std::string refusalName(const testing::TestParamInfo<Refusal> &refusal)
{
    return refusal.param.name;
}

class CommandLineRefusal : public testing::TestWithParam<Refusal>
{ };

void expectRefusal(const std::optional<Result> &result, const QString &line)
{
    ASSERT_TRUE(result);
    EXPECT_EQ(result->status, 2);
    EXPECT_EQ(result->output, QString());
    EXPECT_EQ(result->errors, QStringLiteral("penwick-host: ") + line + QLatin1Char('\n'));
}

} // namespace

TEST_P(CommandLineRefusal, isOneLineAndStatusTwoWithoutAWindow)
{
    expectRefusal(run(GetParam().arguments), QString::fromLatin1(GetParam().line));
}

INSTANTIATE_TEST_SUITE_P(Arguments, CommandLineRefusal,
    testing::Values( //
        Refusal { "unknownOption", words("--colour"), "unknown option '--colour'" },
        Refusal { "unknownOptionWithValue", words("--colour=red"), "unknown option '--colour'" },
        Refusal { "toolkitOption", words("-platform offscreen"), "unknown option '-platform'" },
        Refusal { "abbreviatedOption", words("--win annotation"), "unknown option '--win'" },
        Refusal { "argument", words("picture.png"), "unexpected argument 'picture.png'" },
        Refusal { "emptyArgument", { QString() }, "unexpected argument ''" },
        Refusal {
            "kindOfWindow", words("--window blackboard"), "unknown kind of window 'blackboard'" },
        Refusal { "missingValue", words("--log --window"), "option '--window' needs a value" },
        Refusal { "surplusValue", words("--log=yes"), "option '--log' takes no value" },
        Refusal { "imageAnnotationWithoutImage", words("--window imageAnnotation"),
            "imageAnnotation needs an image: use --image FILE" },
        Refusal { "absentImage", words("--image /no/such/picture.png"),
            "cannot read the image '/no/such/picture.png': No such file or directory" },
        Refusal { "colour", words("--option color#pink"), "there is no colour 'pink'" },
        Refusal { "thickness", words("--option brush#fat"), "'fat' is no number" },
        Refusal { "kindOfOption", words("--option paint#5"), "there is no option 'paint'" },
        Refusal { "screenName", words("--screen first"), "there is no screen 'first'" },
        Refusal { "negativeScreen", words("--screen -1"), "there is no screen '-1'" }),
    refusalName);

TEST(CommandLine, screenThatIsNotThereIsRefused)
{
    expectRefusal(run(words("--screen 7"), QStringLiteral("offscreen")),
        QStringLiteral("there is no screen '7'"));
}

TEST(CommandLine, imageThatIsNoneIsRefusedByName)
{
    const QTemporaryDir folder;
    QFile file(folder.filePath(QStringLiteral("text.png")));
    ASSERT_TRUE(file.open(QIODevice::WriteOnly));
    file.write("no picture at all");
    file.close();

    for (const char *kind : { "whiteboard", "annotation", "imageAnnotation" }) {
        expectRefusal(run({ QStringLiteral("--window"), QLatin1String(kind),
                          QStringLiteral("--image"), file.fileName() }),
            QStringLiteral("cannot decode the image '%1'").arg(file.fileName()));
    }
}

TEST(CommandLine, folderIsNoImage)
{
    const QTemporaryDir folder;

    const std::optional<Result> result = run({ QStringLiteral("--image"), folder.path() });

    ASSERT_TRUE(result);
    EXPECT_EQ(result->status, 2);
    EXPECT_TRUE(result->errors.startsWith(
        QStringLiteral("penwick-host: cannot read the image '%1': ").arg(folder.path())));
}

TEST(CommandLine, helpNamesEveryOption)
{
    const std::optional<Result> result = run(words("--help"));

    ASSERT_TRUE(result);
    EXPECT_EQ(result->status, 0);
    EXPECT_EQ(result->errors, QString());
    for (const char *option : { "--window", "--image", "--title", "--screen", "--announce", "--log",
             "--tool", "--option", "--picture", "--help", "--version" })
        EXPECT_TRUE(result->output.contains(QLatin1String(option))) << option;
}

TEST(CommandLine, versionIsOneLine)
{
    const std::optional<Result> result = run(words("--version"));

    ASSERT_TRUE(result);
    EXPECT_EQ(result->status, 0);
    EXPECT_EQ(result->output, QStringLiteral("penwick-host " PENWICK_HOST_VERSION "\n"));
    EXPECT_EQ(result->errors, QString());
}

TEST(CommandLine, toolThatEndsTheSessionEndsTheHostWithStatusZero)
{
    const std::optional<Result> result
        = run(words("--log --tool state"), QStringLiteral("offscreen"));

    ASSERT_TRUE(result);
    EXPECT_EQ(result->status, 0);
    EXPECT_TRUE(
        result->output.contains(QLatin1String(".penwick.session.end\",\"object\":false}\n")))
        << result->output.toStdString();
}

TEST(CommandLine, pictureOfWhatWasDrawnIsWrittenAtTheEnd)
{
    const QTemporaryDir folder;
    const QString file = folder.filePath(QStringLiteral("board.png"));

    const std::optional<Result> result
        = run({ QStringLiteral("--picture"), file, QStringLiteral("--tool=state") },
            QStringLiteral("offscreen"));

    ASSERT_TRUE(result);
    EXPECT_EQ(result->status, 0);
    const QImage picture(file);
    ASSERT_FALSE(picture.isNull());
    EXPECT_GT(picture.width(), 100);
    EXPECT_EQ(picture.pixelColor(0, 0), QColor(Qt::white)) << "paper, and no border";
}

TEST(CommandLine, pictureThatCannotBeWrittenIsToldAndGivesStatusOne)
{
    const std::optional<Result> result
        = run(words("--picture /nowhere/board.png --tool=state"), QStringLiteral("offscreen"));

    ASSERT_TRUE(result);
    EXPECT_EQ(result->status, 1);
    EXPECT_TRUE(result->errors.endsWith(
        QLatin1String("penwick-host: cannot write the picture '/nowhere/board.png'\n")))
        << result->errors.toStdString();
}

TEST(CommandLine, startCallsComeInTheirOrder)
{
    const std::optional<Result> result
        = run(words("--tool nonsense --option a#b#c --option none --tool=state"),
            QStringLiteral("offscreen"));

    ASSERT_TRUE(result);
    EXPECT_EQ(result->status, 0);
    EXPECT_EQ(result->output,
        QStringLiteral("Selected tool Not Available\n"
                       "Selected tool Option: a#b#c is not available!\n"
                       "Selected tool Option: none is not available!\n"));
}
