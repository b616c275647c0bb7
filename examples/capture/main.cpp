// SPDX-License-Identifier: MIT
// penwick-capture FILE: takes a picture of the screen into FILE for each line on standard input;
// for the line "announce" it shows that the board is being shared instead.
#include "CapturingHost.h"

#include <QApplication>
#include <QSocketNotifier>

#include <array>
#include <cstdio>
#include <exception>
#include <unistd.h>

namespace {

int run(const QString &fileName)
{
    CapturingHost host(fileName);
    if (!host.open())
        return EXIT_FAILURE;
    QSocketNotifier input(STDIN_FILENO, QSocketNotifier::Read);
    QByteArray unread;
    QObject::connect(&input, &QSocketNotifier::activated, &host, [&] {
        std::array<char, 256> buffer {};
        const ssize_t count = read(STDIN_FILENO, buffer.data(), buffer.size());
        if (count <= 0) {
            input.setEnabled(false);
            return;
        }
        unread.append(buffer.data(), count);
        for (qsizetype end = 0; (end = unread.indexOf('\n')) >= 0; unread.remove(0, end + 1)) {
            if (unread.left(end) == "announce")
                host.announce();
            else
                host.capture();
        }
    });
    return QApplication::exec();
}

} // namespace

int main(int argumentCount, char **arguments)
{
    const QApplication application(argumentCount, arguments);
    if (argumentCount != 2) {
        std::fputs("Usage: penwick-capture FILE\n", stderr);
        return 2;
    }
    try {
        return run(QString::fromLocal8Bit(arguments[1]));
    } catch (const std::exception &problem) {
        std::fprintf(stderr, "penwick-capture: %s\n", problem.what());
        return EXIT_FAILURE;
    }
}
