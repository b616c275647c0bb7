// SPDX-License-Identifier: MIT
// The negotiation with the desktop over one window's frame: what was asked for, what is seen, and
// what follows from both. It is a value, with no window, no timer and no desktop inside.
#pragma once

#include <QMargins>
#include <QPoint>
#include <QRect>

#include <chrono>
#include <cstdint>
#include <optional>
#include <variant>
#include <vector>

namespace penwick::platform {

/// What the toolkit and the desktop say of a window at one moment. Rectangles are in points of the
/// toolkit's desktop, y down.
struct FrameObservation
{
    QRect frame; ///< the outer one, as the toolkit believes it
    QRect content;
    QMargins margins; ///< of title bar and borders, as the toolkit believes them
    QPoint screen; ///< the top left corner of the window's screen
    QPoint origin; ///< the primary screen's bottom left corner, where frames are counted from
    double scale = 1.0; ///< device pixels a point
    bool isBorderless = false; ///< and never has a frame
    bool isMinimised = false;
    bool isArranged = false; ///< maximised or full screen: its size is the desktop's

    friend bool operator==(const FrameObservation &, const FrameObservation &) = default;
};

/// Something to tell the window's owner.
struct FrameNews
{
    enum class Kind
    {
        Rescaled, ///< it is on a screen with another number of device pixels a point
        Confirmed, ///< the desktop has granted what was asked for
        Resized,
        ResizedByUser,
        ResizedByDesktop, ///< which gave another size than `asked`
        MoveBegan, ///< by the user, once for each move however many steps it has
        Shifted, ///< moved as a whole, by `delta`
        Moved, ///< its top left corner has moved, or the origin that it is counted from
        Settled ///< nothing is awaited: the frame is what is on the screen
    };

    Kind kind;
    QPoint delta {}; ///< of Shifted alone, y down
    QRectF asked {}; ///< of ResizedByDesktop alone, y down

    friend bool operator==(const FrameNews &, const FrameNews &) = default;
};

/// The geometry to give to the window's content.
struct FramePlacing
{
    QRect content;

    friend bool operator==(const FramePlacing &, const FramePlacing &) = default;
};

/// What to do and to tell, in this order.
using FrameEffects = std::vector<std::variant<FramePlacing, FrameNews>>;

/// The negotiation over one window's outer frame.
///
/// | phase     | means                                  | ends                                  |
/// |-----------|----------------------------------------|---------------------------------------|
/// | Settled   | the frame is what was seen last        | by a request: in Asked                |
/// | Asked     | the frame is what was asked for; the   | when seen as asked: in Granted; after |
/// |           | window seen elsewhere is not believed  | the last look: in Settled; when       |
/// |           |                                        | minimised: in Suspended               |
/// | Granted   | the window was seen as asked; seen     | after the last look, or when          |
/// |           | elsewhere, it may be by an answer to   | minimised: in Settled; by a request:  |
/// |           | an older request                       | in Asked                              |
/// | Suspended | asked for a window that is minimised,  | when restored: in Asked               |
/// |           | for which no desktop answers           |                                       |
/// | Gliding   | the frame is where the window will be; | by a request, at the end of the way   |
/// |           | what is seen on the way is not told    | or before: in Asked                   |
///
/// After a request the desktop has the time of six looks to grant it. After three of them it is
/// asked once more; after the sixth, what is seen counts as its answer.
class FrameNegotiation
{
public:
    using Time = std::chrono::milliseconds; ///< since some moment, on a clock that never goes back

    enum class Phase : std::uint8_t
    {
        Settled,
        Asked,
        Granted,
        Suspended,
        Gliding
    };

    explicit FrameNegotiation(const QRect &frame, QPoint origin);

    /// Points of the toolkit's desktop.
    [[nodiscard]] const QRectF &frame() const { return m_frame; }
    /// Title bar and borders, in points, as last known.
    [[nodiscard]] const QMargins &margins() const { return m_margins; }
    [[nodiscard]] Phase phase() const { return m_phase; }
    /// Whether the frame is what was seen last.
    [[nodiscard]] bool isAtRest() const
    {
        return m_phase == Phase::Settled || m_phase == Phase::Granted;
    }
    /// When to look next, if nothing happens before; nothing where there is nothing to wait for.
    [[nodiscard]] std::optional<Time> nextLook() const;

    /// Keeps `frame` for when the window is shown.
    void askUnseen(const QRectF &frame);
    /// Asks for `frame` of a window on the screen.
    [[nodiscard]] FrameEffects ask(const QRectF &frame, Time now);
    /// The window on the screen sets off to `target`, and counts as being there.
    [[nodiscard]] FrameEffects setOff(const QRectF &target, Time now);
    /// The placing for the next step of a glide, at `frame`.
    [[nodiscard]] FramePlacing step(const QRectF &frame) const;
    /// The window is about to be shown, with borders that are `margins` as far as can be known.
    [[nodiscard]] FrameEffects appear(const QMargins &margins, double scale, Time now);
    /// The desktop says that the frame around the window on the screen has its top left corner at
    /// `corner`, in device pixels; nothing: it has no frame.
    void hearCorner(std::optional<QPoint> corner, Time now);
    /// Says what follows where the window is seen at rest as `seen` by the desktop's own word, and
    /// the toolkit had taken another request for granted.
    [[nodiscard]] FrameEffects learn(const FrameObservation &seen, Time now);
    /// Says what follows from what is seen of the window on the screen.
    [[nodiscard]] FrameEffects look(const FrameObservation &seen, Time now);

private:
    // Whether a window manager has put a frame around the window, as far as the desktop says so.
    enum class Framing : std::uint8_t
    {
        Unknown, // nobody yet, or nobody tells
        There,
        Lost // the window manager has ended; m_margins are its frame's
    };

    // Whether the toolkit was told where the frame is, because it believed in another place.
    enum class Reminder : std::uint8_t
    {
        NotNeeded,
        Given
    };

    // Why the window is not where it was told to be.
    enum class Cause : std::uint8_t
    {
        Program,
        User,
        Desktop // it gave another frame than was asked for
    };

    struct Told
    {
        QRect frame;
        QPoint origin;
    };

    [[nodiscard]] FramePlacing placing() const { return step(m_frame); }
    void await(Time now);
    [[nodiscard]] bool countLook(Time now);
    [[nodiscard]] FrameEffects lookOnTheWay(const FrameObservation &seen);
    void grant(const FrameObservation &seen, bool wasAsked, Time now, FrameEffects &effects);
    void believe(const QRect &outer, const FrameObservation &seen, Cause cause, Time now,
        FrameEffects &effects);
    void adoptScale(const FrameObservation &seen, FrameEffects &effects);
    [[nodiscard]] bool isDecoratedAnew(const FrameObservation &seen) const;
    [[nodiscard]] QRect outerFrame(const FrameObservation &seen) const;
    [[nodiscard]] bool isWhereItBelongs(const QRect &outer) const;
    [[nodiscard]] bool isNew(Time now) const;
    [[nodiscard]] bool isUserMoving(Time now) const;
    void remindToolkit(const FrameObservation &seen, Time now, FrameEffects &effects);
    void tell(QPoint origin, Cause cause, const QRectF &asked, Time now, FrameEffects &effects);
    void tellRescaled(QPoint delta, bool hasResized, Time now, FrameEffects &effects);
    void tellUserMove(Time now, FrameEffects &effects);

    QRectF m_frame;
    QMargins m_margins;
    Phase m_phase = Phase::Settled;
    int m_looksLeft = 0;
    Time m_lookAt {}; // while Asked or Granted
    double m_scale = 1.0; // for which m_margins hold
    bool m_isScaleUntold = false;
    Framing m_framing = Framing::Unknown;
    std::optional<QPoint> m_corner;
    std::optional<Time> m_framedAt; // when the window was last shown or framed
    std::optional<QRectF> m_askedBeforeFrame; // a request given up before the window was framed
    std::optional<Time> m_userRestsAt; // when a move by the user is over, if it does not go on
    Reminder m_reminder = Reminder::NotNeeded;
    Told m_told; // what the listeners know
};

} // namespace penwick::platform
