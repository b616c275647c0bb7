// SPDX-License-Identifier: MIT
#include "Figure.h"

namespace penwick::bench {

Figure timeOf(const std::string &name, const Samples &measured, Target target)
{
    return { name, "us", measured.cpu(), std::nullopt, target, measured.wall() };
}

Figure timeOf(
    const std::string &name, const Samples &measured, const Samples &against, Target target)
{
    return { name, "us", measured.cpu(), against.cpu(), target, measured.wall() };
}

std::optional<double> ratioOf(const Figure &figure)
{
    if (!figure.against)
        return std::nullopt;
    return figure.measured / *figure.against;
}

std::optional<bool> isMet(const Figure &figure)
{
    const auto &[most, mostTimes] = figure.target;
    if (!most && !mostTimes)
        return std::nullopt;
    const auto ratio = ratioOf(figure);
    return (most && figure.measured <= *most) || (mostTimes && ratio && *ratio <= *mostTimes);
}

} // namespace penwick::bench
