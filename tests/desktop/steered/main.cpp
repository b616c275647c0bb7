// SPDX-License-Identifier: MIT
// penwick-host that takes orders while it runs: lines on standard input, each answered by a line
// once it has been carried out.
//   tool NAME, option NAME#VALUE   chooses, as the tool bar would
//   answer                         does nothing but be answered
//   announce                       shows that the window is being shared
//   close                          closes the window
//   let-go-at-end                  from now on lets go of the component inside the news of the end
//   open KIND [WIDTHxHEIGHT]       opens another window instead, on an image of that size
//   open-nowhere                   opens a window on no screen at all
//   frame                          logs the frame that the component says its window has, as
//                                  [x, y, width, height] in points, y up
//   writing                        logs the text of the editor that has the keyboard, what is
//                                  composed in it, and the caret as the input method is told it:
//                                  screen pixels from the top left
//   arrow                          gives the canvas the arrow for its pointer, behind its back
#include "host/Host.h"
#include "host/Session.h"

#include <penwick/platform/NotificationCenter.h>

#include <QApplication>
#include <QInputMethod>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QSocketNotifier>
#include <QTextBlock>
#include <QTextEdit>
#include <QTextLayout>
#include <QWindow>

#include <array>
#include <cstdio>
#include <memory>
#include <unistd.h>

namespace {

using penwick::host::Options;
using penwick::host::Session;
using penwick::host::StartCall;
using penwick::platform::Notification;
using penwick::platform::NotificationCenter;

class Steering final : public QObject
{
public:
    explicit Steering(Session &session)
        : m_session(session)
        , m_input(STDIN_FILENO, QSocketNotifier::Read)
    {
        connect(&m_input, &QSocketNotifier::activated, this, [this] { readInput(); });
    }

    ~Steering() override { NotificationCenter::defaultCenter().removeObserver(this); }

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
            const QString line = QString::fromUtf8(m_unread.left(end));
            m_unread.remove(0, end + 1);
            obey(line.section(QLatin1Char(' '), 0, 0), line.section(QLatin1Char(' '), 1));
            std::puts("{\"event\":\"called\"}");
            std::fflush(stdout);
        }
    }

    void obey(const QString &order, const QString &rest)
    {
        using Operation = StartCall::Operation;
        if (order == QLatin1String("tool"))
            m_session.call({ Operation::ToolSelection, rest });
        else if (order == QLatin1String("option"))
            m_session.call({ Operation::ToolOptionSelection, rest });
        else if (order == QLatin1String("answer"))
            return;
        else if (order == QLatin1String("announce"))
            m_session.announce();
        else if (order == QLatin1String("close"))
            m_session.close();
        else if (order == QLatin1String("let-go-at-end"))
            letGoAtEnd();
        else if (order == QLatin1String("open"))
            open(rest);
        else if (order == QLatin1String("open-nowhere"))
            penwick::Penwick().createDrawingWindowController(
                penwick::WindowType::whiteboard, nullptr);
        else if (order == QLatin1String("frame"))
            logFrame();
        else if (order == QLatin1String("writing"))
            logWriting();
        else if (order == QLatin1String("arrow"))
            m_session.window()
                ->findChild<QWidget *>(QStringLiteral("drawingView"))
                ->setCursor(Qt::ArrowCursor);
        else
            qWarning("no such order: %s", qUtf8Printable(order));
    }

    void logFrame()
    {
        const penwick::platform::Rect frame = m_session.window()->frame();
        std::printf("{\"event\":\"frame\",\"rect\":[%.0f,%.0f,%.0f,%.0f]}\n", frame.x, frame.y,
            frame.width, frame.height);
    }

    static void logWriting()
    {
        QJsonObject writing { { QStringLiteral("event"), QStringLiteral("writing") } };
        if (const auto *const editor = qobject_cast<QTextEdit *>(QApplication::focusWidget())) {
            QString composed;
            for (QTextBlock block = editor->document()->begin(); block.isValid();
                 block = block.next())
                composed += block.layout()->preeditAreaText();
            const QRectF caret = QGuiApplication::inputMethod()->cursorRectangle();
            const QPointF corner = editor->window()->windowHandle()->mapToGlobal(caret.topLeft());
            writing.insert(QStringLiteral("text"), editor->toPlainText());
            writing.insert(QStringLiteral("composed"), composed);
            writing.insert(QStringLiteral("rect"),
                QJsonArray { corner.x(), corner.y(), caret.width(), caret.height() });
        }
        std::puts(QJsonDocument(writing).toJson(QJsonDocument::Compact).constData());
    }

    void letGoAtEnd()
    {
        NotificationCenter::defaultCenter().addObserver(this,
            penwick::penwickSessionEndNotificationKey(),
            [this](const Notification &) { m_session.letGo(); });
    }

    void open(const QString &what)
    {
        Options options;
        const QString kind = what.section(QLatin1Char(' '), 0, 0);
        if (kind == QLatin1String("annotation"))
            options.windowType = penwick::WindowType::annotation;
        else if (kind == QLatin1String("imageAnnotation"))
            options.windowType = penwick::WindowType::imageAnnotation;
        const QString size = what.section(QLatin1Char(' '), 1);
        QImage image;
        if (!size.isEmpty()) {
            image = QImage(size.section(QLatin1Char('x'), 0, 0).toInt(),
                size.section(QLatin1Char('x'), 1).toInt(), QImage::Format_RGB32);
            image.fill(Qt::white);
        }
        if (!m_session.open(options, *QGuiApplication::primaryScreen(), image))
            qWarning("no window");
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
