// SPDX-License-Identifier: MIT
#include "sessions/Step.h"

#include <ostream>

namespace penwick::sessions {

namespace {

rc::Gen<Step> anyStep()
{
    using Kind = Step::Kind;
    const auto kind = rc::gen::weightedElement<Kind>({ { 14, Kind::Press }, { 20, Kind::Drag },
        { 16, Kind::Release }, { 8, Kind::Click }, { 5, Kind::DoublePress },
        { 12, Kind::PressView }, { 10, Kind::Stroke }, { 5, Kind::OtherButton }, { 30, Kind::Tool },
        { 1, Kind::ToolMissed }, { 8, Kind::Option }, { 10, Kind::Write }, { 20, Kind::Key },
        { 10, Kind::Paint }, { 3, Kind::Activate }, { 2, Kind::Deactivate }, { 1, Kind::Minimise },
        { 1, Kind::HideOrShow }, { 2, Kind::PressPanel }, { 1, Kind::Banner }, { 1, Kind::Close },
        { 1, Kind::OpenAnother } });
    const auto number = rc::gen::resize(rc::kNominalSize, rc::gen::inRange(0, 256));
    return rc::gen::construct<Step>(kind, number, number);
}

} // namespace

std::ostream &operator<<(std::ostream &stream, const Step &step)
{
    return stream << static_cast<int>(step.kind) << ' ' << step.a << ' ' << step.b;
}

rc::Gen<Steps> anySteps()
{
    return rc::gen::container<Steps>(anyStep());
}

rc::Shrinkable<Steps> stepsOf(std::uint64_t seed, int count)
{
    return anySteps()(rc::Random(seed), count);
}

} // namespace penwick::sessions
