// SPDX-License-Identifier: MIT
// A settings portal that does as it is told: the second program of WorkspaceTest.
// Usage: FakeSettingsPortal <bus address> <service name, or "-" for none> <value>
// A value is one of: uint:<n> int:<n> string:<text> plain:<n> (a variant only once) notfound.
// It prints "ready"; then each line of its input is carried out and answered by "done":
//   change <value>            stores the value and announces it
//   other <namespace> <key>   announces that another setting became 1
// The end of its input ends it.

#include <QCoreApplication>
#include <QDBusConnection>
#include <QDBusMessage>
#include <QDBusVariant>
#include <QSocketNotifier>
#include <QStringList>
#include <QVariant>

#include <cstdio>
#include <iostream>
#include <string>

namespace {

const auto path = QStringLiteral("/org/freedesktop/portal/desktop");
const auto interfaceName = QStringLiteral("org.freedesktop.portal.Settings");
const auto appearance = QStringLiteral("org.freedesktop.appearance");
const auto contrast = QStringLiteral("contrast");

void say(const char *line)
{
    std::puts(line);
    std::fflush(stdout);
}

QVariant parsedValue(const QString &text)
{
    const QString kind = text.section(QLatin1Char(':'), 0, 0);
    const QString content = text.section(QLatin1Char(':'), 1);
    if (kind == QStringLiteral("string"))
        return content;
    if (kind == QStringLiteral("int"))
        return content.toInt();
    return content.toUInt();
}

} // namespace

/// The portal's one object on the bus.
class FakeSettingsPortal final : public QObject
{
    Q_OBJECT
    Q_CLASSINFO("D-Bus Interface", "org.freedesktop.portal.Settings")

public:
    FakeSettingsPortal(QDBusConnection bus, const QString &value)
        : m_bus(std::move(bus))
        , m_value(value)
    { }

    void obey(const QString &line)
    {
        const QStringList words = line.split(QLatin1Char(' '));
        if (words.value(0) == QStringLiteral("change")) {
            m_value = words.value(1);
            announce(appearance, contrast, parsedValue(m_value));
        } else if (words.value(0) == QStringLiteral("other")) {
            announce(words.value(1), words.value(2), 1U);
        }
        say("done");
    }

public Q_SLOTS:
    Q_SCRIPTABLE void Read(const QString &nameSpace, const QString &key, const QDBusMessage &call)
    {
        call.setDelayedReply(true);
        if (nameSpace != appearance || key != contrast || m_value == QStringLiteral("notfound")) {
            m_bus.send(call.createErrorReply(
                QStringLiteral("org.freedesktop.portal.Error.NotFound"), QStringLiteral("1")));
            return;
        }
        const QDBusVariant inner(parsedValue(m_value));
        const bool isPlain = m_value.startsWith(QStringLiteral("plain:"));
        const QDBusVariant answer = isPlain ? inner : QDBusVariant(QVariant::fromValue(inner));
        m_bus.send(call.createReply(QVariant::fromValue(answer)));
    }

private:
    void announce(const QString &nameSpace, const QString &key, const QVariant &value)
    {
        auto signal
            = QDBusMessage::createSignal(path, interfaceName, QStringLiteral("SettingChanged"));
        signal << nameSpace << key << QVariant::fromValue(QDBusVariant(value));
        m_bus.send(signal);
    }

    QDBusConnection m_bus;
    QString m_value;
};

int main(int argc, char *argv[])
{
    const QCoreApplication application(argc, argv);
    const QStringList arguments = QCoreApplication::arguments();
    auto bus = QDBusConnection::connectToBus(arguments.value(1), QStringLiteral("fake-portal"));
    FakeSettingsPortal portal(bus, arguments.value(3));
    const QString service = arguments.value(2);

    if (!bus.registerObject(path, &portal, QDBusConnection::ExportScriptableSlots)
        || (service != QStringLiteral("-") && !bus.registerService(service))) {
        say("no bus");
        return 1;
    }
    say("ready");

    QSocketNotifier input(0, QSocketNotifier::Read);
    QObject::connect(&input, &QSocketNotifier::activated, &portal, [&portal] {
        // One line at a time is ever under way, so none waits in the stream's buffer.
        std::string line;
        if (std::getline(std::cin, line))
            portal.obey(QString::fromStdString(line));
        else
            QCoreApplication::quit();
    });
    return QCoreApplication::exec();
}

#include "FakeSettingsPortal.moc"
