// SPDX-License-Identifier: MIT
// Measures what people feel of a drawing program, and compares it with targets.
#include "Accuracy.h"
#include "FigureTable.h"
#include "Growth.h"

#include <QApplication>
#include <QCommandLineParser>
#include <QProcess>
#include <QTemporaryFile>

#include <cstdio>
#include <string_view>
#include <utility>

namespace {

using namespace penwick::bench;

// In the order of the table.
constexpr std::pair<const char *, Figures (*)()> sections[] {
    { "drag", dragFigures },
    { "longstroke", longStrokeFigures },
    { "eraser", eraserFigures },
    { "history", historyFigures },
    { "window", windowFigures },
    { "memory", memoryFigures },
    { "idle", idleFigures },
    { "opening", openingFigures },
    { "text", textFigures },
};

/// The next application has one screen, of 1920 by 1080 points, that is not there. The file that
/// says so must outlive it.
void prepareScreen(QTemporaryFile &file, int scale)
{
    const QByteArray width = QByteArray::number(1920 * scale);
    const QByteArray height = QByteArray::number(1080 * scale);
    if (!file.open())
        qFatal("there is no place for a temporary file");
    file.write(R"({"screens": [{"name": "screen", "x": 0, "y": 0, "width": )" + width
        + R"(, "height": )" + height + R"(, "logicalDpi": 96, "logicalBaseDpi": 96, "dpr": 1}]})");
    file.flush();
    qputenv("QT_QPA_PLATFORM", "offscreen:configfile=" + file.fileName().toLocal8Bit());
    qputenv("QT_SCALE_FACTOR", QByteArray::number(scale));
}

/// Prints the toolkit's warnings and errors, but for one: the offscreen platform warns for each
/// window that it cannot raise it.
void printProblem(QtMsgType type, const QMessageLogContext &, const QString &message)
{
    if (type != QtDebugMsg && type != QtInfoMsg && !message.contains(QLatin1String("raise()")))
        std::fprintf(stderr, "%s\n", message.toLocal8Bit().constData());
}

/// One scale in this process; what is measured goes to standard output line by line.
void measure(int scale, const QString &only)
{
    for (const auto &[name, figuresOf] : sections) {
        if (!only.isEmpty() && only != QLatin1String(name))
            continue;
        std::fprintf(stderr, "scale %d: %s\n", scale, name);
        for (const Figure &figure : figuresOf())
            std::printf("%s\n", lineOf({ scale, figure }).c_str());
        std::fflush(stdout);
    }
}

/// Every scale in a process of its own, because a process has one; then the table.
int measureAll(const QString &only)
{
    std::vector<ScaledFigure> figures;
    for (const int scale : { 1, 2 }) {
        QProcess process;
        process.setProcessChannelMode(QProcess::ForwardedErrorChannel);
        QStringList arguments { QStringLiteral("--scale"), QString::number(scale) };
        if (!only.isEmpty())
            arguments << QStringLiteral("--only") << only;
        process.start(QCoreApplication::applicationFilePath(), arguments);
        process.waitForFinished(-1);
        if (process.exitStatus() != QProcess::NormalExit || process.exitCode() != 0)
            return EXIT_FAILURE;
        for (const QByteArray &line : process.readAllStandardOutput().split('\n')) {
            if (const auto figure = figureFrom(line.toStdString()))
                figures.push_back(*figure);
        }
    }
    return printTable(figures) ? EXIT_SUCCESS : EXIT_FAILURE;
}

int scaleFrom(int argc, char **argv)
{
    for (int index = 1; index + 1 < argc; ++index) {
        if (std::string_view(argv[index]) == "--scale")
            return std::max(1, std::atoi(argv[index + 1]));
    }
    return 1;
}

} // namespace

int main(int argc, char **argv)
{
    QTemporaryFile screen;
    const int scale = scaleFrom(argc, argv); // needed before there is an application
    prepareScreen(screen, scale);
    qInstallMessageHandler(printProblem);
    const QApplication application(argc, argv);
    QCommandLineParser parser;
    const QCommandLineOption scaleOption(QStringLiteral("scale"),
        QStringLiteral("Measure at <pixels> a point only, and print lines for the table."),
        QStringLiteral("pixels"));
    const QCommandLineOption onlyOption(QStringLiteral("only"),
        QStringLiteral("Measure one part: drag, longstroke, eraser, history, window, memory, "
                       "idle, opening or text."),
        QStringLiteral("part"));
    const QCommandLineOption growthOption(QStringLiteral("growth"),
        QStringLiteral("Print, as CSV, how costs grow up to 100,000 strokes."));
    const QCommandLineOption accuracyOption(
        QStringLiteral("accuracy"), QStringLiteral("Print how true the edges of strokes are."));
    parser.addOptions({ scaleOption, onlyOption, growthOption, accuracyOption });
    parser.addHelpOption();
    parser.process(application);

    if (parser.isSet(growthOption))
        printGrowth();
    else if (parser.isSet(accuracyOption))
        printAccuracy();
    else if (parser.isSet(scaleOption))
        measure(scale, parser.value(onlyOption));
    else
        return measureAll(parser.value(onlyOption));
    return EXIT_SUCCESS;
}
