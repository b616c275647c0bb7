// SPDX-License-Identifier: MIT
// The test's own connection to the X server that it started.
// Without the X headers: they define words (None, Bool, Status) that everybody else uses too.
#pragma once

#include <string>
#include <vector>

class QRect;
// NOLINTNEXTLINE(bugprone-reserved-identifier): X's own name for what a Display points at
struct _XDisplay;

namespace penwick::desktop {

/// What a window manager is asked to see how far it has come.
enum class ProbeWith
{
    FrameQuestion, ///< what frame a window would have; not all know it
    SelectionQuestion ///< the manager's own selection; not all answer it
};

/// One open connection. Errors of single requests (a window that is gone) are ignored, as the
/// answers say so too; the loss of the server ends the test process.
class XConnection final
{
public:
    /// Throws a runtime_error when the display does not answer.
    explicit XConnection(const std::string &displayName);
    ~XConnection();
    XConnection(const XConnection &) = delete;
    XConnection &operator=(const XConnection &) = delete;

    [[nodiscard]] _XDisplay *display() const { return m_display; }
    [[nodiscard]] unsigned long root() const;
    [[nodiscard]] unsigned long atom(const char *name) const;

    /// Whether some program holds the selection called `name`.
    [[nodiscard]] bool hasSelectionOwner(const char *name) const;

    /// Replaces the server's monitors by these, the first one the primary one.
    void setMonitors(const std::vector<QRect> &monitors) const;

    /// Returns once the server has done everything asked so far.
    void finish() const;

    /// Waits until the window manager answers; from then on finishWithWindowManager() asks it, too.
    void awaitWindowManager(ProbeWith question);
    /// Asks it no more: it is about to go.
    void forgetWindowManager() { m_probe = 0; }

    /// Returns once the server and the window manager have dealt with everything sent so far.
    ///
    /// A window manager may hold the pointer at a press until it has looked at it. A hand is slower
    /// than that; what a test sends meanwhile can be lost, a release and the next press together.
    void finishWithWindowManager() const;

private:
    void deleteMonitorsFrom(std::size_t index) const;
    [[nodiscard]] unsigned long makeProbe() const;
    void askWindowManager(unsigned long probe) const;
    [[nodiscard]] bool hasAnswered(unsigned long probe) const;

    _XDisplay *const m_display;
    ProbeWith m_question = ProbeWith::FrameQuestion;
    unsigned long m_probe = 0; // a window never shown, about which the window manager is asked
};

} // namespace penwick::desktop
