// SPDX-License-Identifier: MIT
#include "CommandLine.h"

#include <QLocale>

#include <array>
#include <functional>

namespace penwick::host {

namespace {

/// What is wrong with an option's value; empty if nothing is.
using Complaint = QString;

struct Option
{
    const char *name;
    const char *valueName; ///< null for an option without a value
    std::function<Complaint(Options &, const QString &value)> apply;
};

Complaint applyWindow(Options &options, const QString &value)
{
    constexpr std::array<std::pair<const char *, WindowType>, 3> kinds {
        { { "whiteboard", WindowType::whiteboard }, { "annotation", WindowType::annotation },
            { "imageAnnotation", WindowType::imageAnnotation } }
    };
    for (const auto &[name, type] : kinds) {
        if (value == QLatin1String(name)) {
            options.windowType = type;
            return {};
        }
    }
    return QStringLiteral("unknown kind of window '%1'").arg(value);
}

Complaint applyScreen(Options &options, const QString &value)
{
    bool isNumber = false;
    options.screen = value.toInt(&isNumber);
    if (!isNumber || options.screen < 0)
        return QStringLiteral("there is no screen '%1'").arg(value);
    return {};
}

// The component ignores an option that it does not know without a word, so the mistake is told
// here. About an option that is not of the form NAME#VALUE the component prints a line itself.
Complaint complaintAboutOption(const QString &option)
{
    static const QStringList colors { QStringLiteral("black"), QStringLiteral("white"),
        QStringLiteral("dark_grey"), QStringLiteral("dark_blue"), QStringLiteral("red"),
        QStringLiteral("green"), QStringLiteral("yellow"), QStringLiteral("light_grey"),
        QStringLiteral("light_blue") };
    const QStringList parts = option.split(QLatin1Char('#'));
    if (parts.size() != 2)
        return {};
    const QString &name = parts.at(0);
    const QString &value = parts.at(1);
    if (name == QLatin1String("color"))
        return colors.contains(value) ? Complaint()
                                      : QStringLiteral("there is no colour '%1'").arg(value);
    if (name != QLatin1String("brush") && name != QLatin1String("text"))
        return QStringLiteral("there is no option '%1'").arg(name);
    bool isNumber = false;
    QLocale locale; // as the component reads them
    locale.setNumberOptions(QLocale::RejectGroupSeparator);
    static_cast<void>(locale.toDouble(value, &isNumber));
    return isNumber ? Complaint() : QStringLiteral("'%1' is no number").arg(value);
}

Complaint addStartCall(Options &options, StartCall::Operation operation, const QString &argument)
{
    options.startCalls.push_back({ operation, argument });
    return {};
}

const std::vector<Option> &knownOptions()
{
    using Operation = StartCall::Operation;
    static const std::vector<Option> options {
        { "--window", "KIND", applyWindow },
        { "--image", "FILE",
            [](Options &o, const QString &v) { return o.imageFile = v, Complaint(); } },
        { "--title", "TEXT",
            [](Options &o, const QString &v) { return o.title = v, Complaint(); } },
        { "--screen", "N", applyScreen },
        { "--announce", nullptr,
            [](Options &o, const QString &) { return o.announcesSharing = true, Complaint(); } },
        { "--log", nullptr,
            [](Options &o, const QString &) { return o.logsEvents = true, Complaint(); } },
        { "--tool", "NAME",
            [](Options &o, const QString &v) {
                return addStartCall(o, Operation::ToolSelection, v);
            } },
        { "--option", "NAME#VALUE",
            [](Options &o, const QString &v) {
                const Complaint complaint = complaintAboutOption(v);
                return complaint.isEmpty() ? addStartCall(o, Operation::ToolOptionSelection, v)
                                           : complaint;
            } },
        { "--picture", "FILE",
            [](Options &o, const QString &v) { return o.pictureFile = v, Complaint(); } },
        { "--help", nullptr,
            [](Options &o, const QString &) {
                return o.action = Options::Action::ShowHelp, Complaint();
            } },
        { "--version", nullptr,
            [](Options &o, const QString &) {
                return o.action = Options::Action::ShowVersion, Complaint();
            } },
    };
    return options;
}

const Option *findOption(const QString &name)
{
    for (const Option &option : knownOptions()) {
        if (name == QLatin1String(option.name))
            return &option;
    }
    return nullptr;
}

} // namespace

std::variant<Options, UsageError> parseCommandLine(const QStringList &arguments)
{
    Options options;
    for (qsizetype index = 0; index < arguments.size(); ++index) {
        const QString &argument = arguments.at(index);
        const qsizetype equals
            = argument.startsWith(QLatin1String("--")) ? argument.indexOf(QLatin1Char('=')) : -1;
        const QString name = equals < 0 ? argument : argument.left(equals);
        const Option *const option = findOption(name);
        if (!option) {
            return UsageError { name.startsWith(QLatin1Char('-'))
                    ? QStringLiteral("unknown option '%1'").arg(name)
                    : QStringLiteral("unexpected argument '%1'").arg(name) };
        }
        QString value;
        if (option->valueName && equals >= 0)
            value = argument.mid(equals + 1);
        else if (option->valueName && ++index < arguments.size())
            value = arguments.at(index);
        else if (option->valueName)
            return UsageError { QStringLiteral("option '%1' needs a value").arg(name) };
        else if (equals >= 0)
            return UsageError { QStringLiteral("option '%1' takes no value").arg(name) };

        const Complaint complaint = option->apply(options, value);
        if (!complaint.isEmpty())
            return UsageError { complaint };
        if (options.action != Options::Action::OpenWindow)
            return options;
    }
    if (options.windowType == WindowType::imageAnnotation && !options.imageFile)
        return UsageError { QStringLiteral("imageAnnotation needs an image: use --image FILE") };
    return options;
}

QString helpText()
{
    return QStringLiteral(
        "Usage: penwick-host [options]\n"
        "Opens a drawing window and ends with it.\n"
        "\n"
        "  --window KIND        whiteboard (the default), annotation or imageAnnotation\n"
        "  --image FILE         the picture to draw on; imageAnnotation needs one\n"
        "  --title TEXT         title of an imageAnnotation window\n"
        "  --screen N           screen to open on, counted from 0, the primary one\n"
        "  --announce           show that the window is being shared\n"
        "  --log                write what happens to standard output, one JSON object a line\n"
        "  --tool NAME          choose a tool at start, for example eraser\n"
        "  --option NAME#VALUE  choose an option at start, for example color#red\n"
        "  --picture FILE       write what was drawn to FILE when the session ends\n"
        "  --help               show this text\n"
        "  --version            show the version\n"
        "\n"
        "--tool and --option may be given several times and are called in their order.\n"
        "Exit status: 0 when the session has ended, 1 when its picture could not be written,\n"
        "2 when the options cannot be used.\n");
}

} // namespace penwick::host
