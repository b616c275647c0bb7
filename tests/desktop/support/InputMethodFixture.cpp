// SPDX-License-Identifier: MIT
#include "desktop/support/InputMethodFixture.h"

#include <algorithm>

namespace penwick::desktop {

namespace {

bool isBlank(const Writing &writing)
{
    return writing.text.isEmpty() && writing.composed.isEmpty();
}

} // namespace

InputMethodTest::InputMethodTest()
    : m_method(desktop(), GetParam())
{
    open(HostProgram::Steered, {}, m_method.environment());
    host().selectTool(QStringLiteral("text"));
    desktop().pointer().moveTo(onScreen(farAway));
}

QPoint InputMethodTest::makeBoxToCompose(QPoint clicked)
{
    const QPoint corner = makeBox(clicked);
    // The input method hears of the box some time after it is there.
    require(
        [&] {
            press("a");
            require([&] { return !isBlank(host().writing()); }, "a letter to arrive");
            const bool isComposed = !host().writing().composed.isEmpty();
            press("BackSpace");
            require([&] { return isBlank(host().writing()); }, "the letter to go");
            return isComposed;
        },
        "the input method to compose");
    return corner;
}

void InputMethodTest::editAtTheBeginning(QPoint corner)
{
    constexpr QPoint ofTheText(5, newBoxSize.height() / 2);
    doubleClick(corner + ofTheText + QPoint(60, 0));
    require([&] { return isEdited(corner); }, "the box to be edited");
    click(corner + ofTheText);
    require([&] { return host().writing().caret.left() == onScreen(corner + ofTheText).x(); },
        "the caret to stand before the text");
}

testing::AssertionResult InputMethodTest::comesToHold(const char *text, const char *composed)
{
    Writing seen;
    const bool came = waitUntil([&] {
        seen = host().writing();
        return seen.text == QString::fromUtf8(text) && seen.composed == QString::fromUtf8(composed);
    });
    return came ? testing::AssertionSuccess()
                : testing::AssertionFailure() << "it holds \"" << seen.text.toStdString()
                                              << "\" and \"" << seen.composed.toStdString() << '"';
}

void InputMethodTest::askForCandidates()
{
    press("space");
    press("space");
    require([&] { return !candidates().isNull(); }, "a list of what may be meant");
}

QRect InputMethodTest::candidates()
{
    constexpr int leastHeight = 100; // of some lines; the panel may show a mark before
    const std::vector<WindowId> own = desktop().windows().ofProcess(host().processId());
    QRect found;
    for (const WindowId list : desktop().windows().lists()) {
        const QRect area = desktop().windows().clientArea(list);
        if (std::find(own.begin(), own.end(), list) == own.end() && area.height() > leastHeight)
            found = area;
    }
    return found;
}

bool InputMethodTest::areCandidatesGone()
{
    return waitUntil([this] { return candidates().isNull(); });
}

void InputMethodTest::keepPicture(const char *name)
{
    const QString folder = qEnvironmentVariable("PENWICK_PICTURES");
    if (folder.isEmpty())
        return;
    const std::string file = methodName({ GetParam(), 0 }) + '-' + name + ".png";
    desktop().screen().picture().save(folder + QLatin1Char('/') + QString::fromStdString(file));
}

std::string methodName(const testing::TestParamInfo<InputMethodKind> &kind)
{
    return kind.param == InputMethodKind::Ibus ? "ibus" : "fcitx5";
}

} // namespace penwick::desktop
