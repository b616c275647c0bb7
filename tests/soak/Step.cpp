// SPDX-License-Identifier: MIT
#include "soak/Step.h"

#include <ostream>

namespace penwick::test {

namespace {

using Kind = Step::Kind;

rc::Gen<Kind> frequentKind()
{
    return rc::gen::weightedElement<Kind>({ { 14, Kind::Press }, { 20, Kind::Drag },
        { 16, Kind::Release }, { 8, Kind::Click }, { 5, Kind::DoublePress },
        { 12, Kind::PressView }, { 10, Kind::Stroke }, { 5, Kind::OtherButton }, { 30, Kind::Tool },
        { 1, Kind::ToolMissed }, { 8, Kind::Option }, { 10, Kind::Write }, { 20, Kind::Key },
        { 10, Kind::Paint }, { 3, Kind::Activate }, { 2, Kind::Deactivate }, { 1, Kind::Minimise },
        { 1, Kind::HideOrShow }, { 2, Kind::PressPanel }, { 1, Kind::Banner }, { 1, Kind::Close },
        { 1, Kind::OpenAnother } });
}

rc::Gen<Kind> seldomKind()
{
    return rc::gen::weightedElement<Kind>({ { 10, Kind::PressText }, { 30, Kind::Edit },
        { 10, Kind::Compose }, { 5, Kind::DragText }, { 12, Kind::Menu }, { 3, Kind::MoveWindow },
        { 2, Kind::ResizeWindow }, { 10, Kind::Tremble } });
}

rc::Gen<Step> anyStep()
{
    const auto kind = rc::gen::weightedOneOf<Kind>({ { 3, frequentKind() }, { 1, seldomKind() } });
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

} // namespace penwick::test
