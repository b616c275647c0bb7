// SPDX-License-Identifier: MIT
// A desktop for tests of the negotiation: the test decides everything that it shows and says.
#pragma once

#include "platform/window/FrameNegotiation.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <functional>
#include <optional>
#include <ostream>
#include <sstream>
#include <string>
#include <vector>

namespace penwick::platform {

inline const QMargins none;
inline const QMargins borders(1, 20, 1, 5);
inline const QRect asked(300, 400, 200, 100);
inline const QRect elsewhere(350, 430, 200, 100);

inline std::string inWords(const QRect &rect)
{
    std::ostringstream words;
    words << rect.x() << ',' << rect.y() << ' ' << rect.width() << 'x' << rect.height();
    return words.str();
}

inline std::string inWords(const FrameNews &news)
{
    static const std::vector<std::string> names { "rescaled", "confirmed", "resized",
        "resizedByUser", "resizedByDesktop", "moveBegan", "shifted", "moved", "settled" };
    const std::string name = names.at(static_cast<std::size_t>(news.kind));
    if (news.kind == FrameNews::Kind::Shifted)
        return name + ' ' + std::to_string(news.delta.x()) + ',' + std::to_string(news.delta.y());
    if (news.kind == FrameNews::Kind::ResizedByDesktop)
        return name + ' ' + inWords(news.asked.toRect());
    return name;
}

/// A desktop of which a test decides what it shows of the window, what it says, and when. What the
/// negotiation does and tells is kept, in order.
class Desk
{
public:
    void askUnseen(const QRect &frame) { m_negotiation.askUnseen(frame); }
    void ask(const QRect &frame) { keep(m_negotiation.ask(frame, m_now)); }

    /// Shows a window whose frame is asked for at `frame` and believed to have `margins`.
    void show(const QRect &frame, const QMargins &margins, double scale = 1.0)
    {
        m_seen.scale = scale;
        m_negotiation.askUnseen(frame);
        keep(m_negotiation.appear(margins, scale, m_now));
    }

    /// The toolkit sees the window with this outer frame and these borders.
    void sees(const QRect &frame, const QMargins &margins)
    {
        m_seen.frame = frame;
        m_seen.margins = margins;
        m_seen.content = frame.marginsRemoved(margins);
        look();
    }

    void hears(std::optional<QPoint> corner)
    {
        m_negotiation.hearCorner(corner, m_now);
        look();
    }

    /// The desktop says by its own word that the window is at `frame`.
    void learns(const QRect &frame)
    {
        m_seen.frame = frame;
        m_seen.content = frame.marginsRemoved(m_seen.margins);
        keep(m_negotiation.learn(m_seen, m_now));
    }

    void setOff(const QRect &target) { keep(m_negotiation.setOff(target, m_now)); }
    void step(const QRect &frame) { keep({ m_negotiation.step(frame) }); }

    void look() { keep(m_negotiation.look(m_seen, m_now)); }

    /// Lets time pass, looking whenever that was asked for.
    void wait(int milliseconds)
    {
        const auto end = m_now + FrameNegotiation::Time(milliseconds);
        while (m_negotiation.nextLook() && *m_negotiation.nextLook() <= end) {
            m_now = std::max(m_now, *m_negotiation.nextLook());
            look();
        }
        m_now = end;
    }

    /// Like show(), and then lets the window come to rest at `frame`; nothing of that is in the
    /// log.
    void settle(const QRect &frame, const QMargins &margins, double scale = 1.0)
    {
        show(frame, margins, scale);
        sees(frame, margins);
        wait(5000);
        m_log.clear();
    }

    FrameObservation &seen() { return m_seen; }
    [[nodiscard]] const FrameNegotiation &negotiation() const { return m_negotiation; }
    [[nodiscard]] const std::string &log() const { return m_log; }

private:
    void keep(const FrameEffects &effects)
    {
        // Settled comes with each look at a window at rest. It is noted only together with others.
        if (effects == FrameEffects { FrameNews { FrameNews::Kind::Settled } })
            return;
        for (const auto &effect : effects) {
            const auto *const placing = std::get_if<FramePlacing>(&effect);
            m_log += m_log.empty() ? "" : "; ";
            m_log += placing ? "place " + inWords(placing->content)
                             : inWords(std::get<FrameNews>(effect));
        }
    }

    FrameNegotiation m_negotiation { QRect(0, 0, 10, 10), QPoint(0, 800) };
    FrameObservation m_seen { {}, {}, {}, {}, { 0, 800 } };
    FrameNegotiation::Time m_now { 1000 };
    std::string m_log;
};

/// What happens on a desktop, and what is made of it.
struct FrameRow
{
    const char *name;
    std::function<void(Desk &)> happens;
    const char *told;
    QRect frame; // in the end
    FrameNegotiation::Phase phase;
};

inline std::ostream &operator<<(std::ostream &stream, const FrameRow &row)
{
    return stream << row.name;
}

class FrameNegotiationTest : public testing::TestWithParam<FrameRow>
{
protected:
    static void expectAnswer(const FrameRow &row)
    {
        Desk desk;
        row.happens(desk);
        EXPECT_EQ(desk.log(), row.told);
        EXPECT_EQ(desk.negotiation().frame(), QRectF(row.frame))
            << inWords(desk.negotiation().frame().toRect());
        EXPECT_EQ(desk.negotiation().phase(), row.phase);
    }
};

} // namespace penwick::platform
