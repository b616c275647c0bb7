// SPDX-License-Identifier: MIT
// What the tool bar shows after the host has chosen a tool and options at start.
#include "host/Host.h"
#include "host/Session.h"

#include <gtest/gtest.h>

#include <QAbstractButton>
#include <QApplication>
#include <QImage>

#include <vector>

namespace {

/// The choices that look chosen, and the colour on the colour button.
struct Bar
{
    QStringList tools;
    QStringList options;
    QColor color;
    bool hasOpenPopover = false;
};

QColor middleOf(const QImage &picture)
{
    return picture.pixelColor(picture.rect().center());
}

Bar barNow()
{
    Bar bar;
    for (QWidget *const widget : QApplication::allWidgets()) {
        const bool isButton = qobject_cast<QAbstractButton *>(widget);
        const QString identifier = widget->property("identifier").toString();
        if (!isButton || identifier.isEmpty())
            continue;
        const bool isOption = identifier.contains(u'#');
        if (widget->property("isSelected").toBool())
            (isOption ? bar.options : bar.tools).append(identifier);
        if (identifier == u"color")
            bar.color = middleOf(widget->grab().toImage());
        bar.hasOpenPopover = bar.hasOpenPopover || (isOption && widget->isVisible());
    }
    bar.options.sort();
    return bar;
}

/// The bar after a start with these arguments; the session is closed then.
Bar barAfter(std::vector<const char *> arguments)
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    arguments.insert(arguments.begin(), "penwick-host");
    Bar bar;
    EXPECT_EQ(0,
        penwick::host::runHost(static_cast<int>(arguments.size()),
            const_cast<char **>(arguments.data()), [&bar](penwick::host::Session &session) {
                bar = barNow();
                QMetaObject::invokeMethod(
                    &session, [&session] { session.close(); }, Qt::QueuedConnection);
            }));
    return bar;
}

TEST(StartChoice, withoutAnyIsTheBrushInBlack)
{
    const Bar bar = barAfter({});

    EXPECT_EQ(bar.tools, QStringList { QStringLiteral("brush") });
    EXPECT_TRUE(bar.options.contains(QStringLiteral("color#black")));
    EXPECT_FALSE(bar.hasOpenPopover);
}

TEST(StartChoice, isWhatTheBarShows)
{
    const Bar bar = barAfter({ "--tool=eraser", "--option=color#red", "--tool=text" });

    EXPECT_EQ(bar.tools, QStringList { QStringLiteral("text") });
    EXPECT_TRUE(bar.options.contains(QStringLiteral("color#red")));
    EXPECT_FALSE(bar.options.contains(QStringLiteral("color#black")));
    EXPECT_GT(bar.color.red(), bar.color.green() + 100);
    EXPECT_FALSE(bar.hasOpenPopover);
}

TEST(StartChoice, ofTheToolThatIsChosenOpensNoPopover)
{
    const Bar bar = barAfter({ "--tool=brush" });

    EXPECT_EQ(bar.tools, QStringList { QStringLiteral("brush") });
    EXPECT_FALSE(bar.hasOpenPopover);
}

} // namespace
