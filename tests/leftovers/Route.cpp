// SPDX-License-Identifier: MIT
#include "leftovers/Route.h"

#include <array>
#include <cstddef>
#include <cstdio>

namespace penwick::test {

namespace {

constexpr std::array momentNames { "at rest", "stroke", "edit", "popover", "banner", "settling",
    "glide" };
constexpr std::array endNames { "END", "title bar", "host closes", "host drops" };

} // namespace

const std::vector<Route> &allRoutes()
{
    static const std::vector<Route> routes = [] {
        std::vector<Route> all;
        for (std::size_t moment = 0; moment < momentNames.size(); ++moment) {
            for (std::size_t end = 0; end < endNames.size(); ++end) {
                const Route route { static_cast<Moment>(moment), static_cast<End>(end) };
                if (route.moment != Moment::Stroke || route.end != End::EndButton)
                    all.push_back(route);
            }
        }
        return all;
    }();
    return routes;
}

void sayRoutes(const std::vector<int> &taken)
{
    std::printf("%-12s", "ended by");
    for (const char *const moment : momentNames)
        std::printf("%9s", moment);
    for (std::size_t end = 0; end < endNames.size(); ++end) {
        std::printf("\n%-12s", endNames[end]);
        for (std::size_t moment = 0; moment < momentNames.size(); ++moment) {
            int times = 0;
            for (std::size_t index = 0; index < taken.size(); ++index) {
                const Route &route = allRoutes()[index];
                if (route.moment == static_cast<Moment>(moment)
                    && route.end == static_cast<End>(end))
                    times += taken[index];
            }
            std::printf("%9d", times);
        }
    }
    std::putchar('\n');
}

} // namespace penwick::test
