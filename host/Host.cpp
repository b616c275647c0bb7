// SPDX-License-Identifier: MIT
#include "Host.h"

#include "CommandLine.h"
#include "EventLog.h"
#include "Session.h"

#include <QApplication>
#include <QFile>
#include <QImageReader>
#include <QScreen>

#include <cstdio>
#include <cstdlib>

namespace penwick::host {

namespace {

constexpr int unusableOptions = 2;

int complain(const QString &message)
{
    std::fprintf(stderr, "penwick-host: %s\n", message.toLocal8Bit().constData());
    return unusableOptions;
}

int print(const QString &text)
{
    std::fputs(text.toLocal8Bit().constData(), stdout);
    return EXIT_SUCCESS;
}

// The picture in `fileName`, or in `complaint` why there is none.
std::optional<QImage> readImage(const QString &fileName, QString &complaint)
{
    QFile file(fileName);
    if (!file.open(QIODevice::ReadOnly)) {
        complaint
            = QStringLiteral("cannot read the image '%1': %2").arg(fileName, file.errorString());
        return std::nullopt;
    }
    QImageReader reader(&file);
    reader.setDecideFormatFromContent(true);
    reader.setAutoTransform(true);
    QImage image = reader.read();
    if (image.isNull()) {
        complaint = QStringLiteral("cannot decode the image '%1'").arg(fileName);
        return std::nullopt;
    }
    return image;
}

int openWindow(const Options &options, char *programName, const std::optional<QImage> &image,
    const std::function<void(Session &)> &onOpened)
{
    // Only its own name is handed on: the toolkit's options are not this program's.
    int count = 1;
    char *names[] = { programName, nullptr };
    QApplication application(count, names);
    QApplication::setQuitOnLastWindowClosed(false); // the session decides, not a window

    const QList<QScreen *> screens = QGuiApplication::screens();
    if (options.screen >= screens.size())
        return complain(QStringLiteral("there is no screen '%1'").arg(options.screen));

    std::optional<EventLog> log;
    if (options.logsEvents)
        log.emplace();
    Session session;
    if (!session.open(options, *screens.at(options.screen), image))
        return EXIT_FAILURE;
    if (onOpened)
        onOpened(session);
    return QApplication::exec();
}

} // namespace

int runHost(int argumentCount, char **arguments, const std::function<void(Session &)> &onOpened)
{
    QStringList texts;
    for (int index = 1; index < argumentCount; ++index)
        texts.append(QString::fromLocal8Bit(arguments[index]));
    const auto parsed = parseCommandLine(texts);
    if (const auto *const error = std::get_if<UsageError>(&parsed))
        return complain(error->message);
    const Options &options = std::get<Options>(parsed);

    switch (options.action) {
    case Options::Action::ShowHelp:
        return print(helpText());
    case Options::Action::ShowVersion:
        return print(QStringLiteral("penwick-host " PENWICK_HOST_VERSION "\n"));
    case Options::Action::OpenWindow:
        break;
    }
    std::optional<QImage> image;
    if (options.imageFile) {
        QString complaint;
        image = readImage(*options.imageFile, complaint);
        if (!image)
            return complain(complaint);
    }
    return openWindow(options, arguments[0], image, onOpened);
}

} // namespace penwick::host
