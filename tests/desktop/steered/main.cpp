// SPDX-License-Identifier: MIT
// penwick-host with a way to choose tools while it runs: "tool NAME" and "option NAME#VALUE" lines
// on standard input, each answered by a line once it has been done.
#include "host/Host.h"
#include "host/Session.h"

#include <QSocketNotifier>

#include <array>
#include <cstdio>
#include <memory>
#include <unistd.h>

namespace {

using penwick::host::Session;
using penwick::host::StartCall;

class Steering final : public QObject
{
public:
    explicit Steering(Session &session)
        : m_session(session)
        , m_input(STDIN_FILENO, QSocketNotifier::Read)
    {
        connect(&m_input, &QSocketNotifier::activated, this, [this] { readInput(); });
    }

private:
    void readInput()
    {
        std::array<char, 512> buffer {};
        const ssize_t count = read(STDIN_FILENO, buffer.data(), buffer.size());
        if (count <= 0) {
            m_input.setEnabled(false);
            return;
        }
        m_unread.append(buffer.data(), count);
        for (qsizetype end = 0; (end = m_unread.indexOf('\n')) >= 0;) {
            const QByteArray line = m_unread.left(end);
            m_unread.remove(0, end + 1);
            obey(QString::fromUtf8(line));
        }
    }

    void obey(const QString &line)
    {
        using Operation = StartCall::Operation;
        const Operation operation = line.startsWith(QLatin1String("tool "))
            ? Operation::ToolSelection
            : Operation::ToolOptionSelection;
        m_session.call({ operation, line.section(QLatin1Char(' '), 1) });
        std::puts("{\"event\":\"called\"}");
        std::fflush(stdout);
    }

    Session &m_session;
    QSocketNotifier m_input;
    QByteArray m_unread;
};

} // namespace

int main(int argumentCount, char **arguments)
{
    std::unique_ptr<Steering> steering;
    return penwick::host::runHost(argumentCount, arguments,
        [&steering](Session &session) { steering = std::make_unique<Steering>(session); });
}
