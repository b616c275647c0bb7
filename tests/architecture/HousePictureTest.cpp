// SPDX-License-Identifier: MIT
// The picture of the folders, held against what they say of themselves.
#include "architecture/SourceTree.h"

#include <gtest/gtest.h>

#include <fstream>
#include <functional>
#include <iterator>
#include <regex>

namespace penwick::test {

namespace {

using Arrows = std::map<std::string, std::set<std::string>>;

/// Every folder, and all that can be reached from it.
Arrows reached(const Arrows &arrows)
{
    Arrows all;
    const std::function<void(const std::string &, std::set<std::string> &)> collect
        = [&](const std::string &name, std::set<std::string> &into) {
              for (const std::string &next : arrows.at(name)) {
                  if (into.insert(next).second)
                      collect(next, into);
              }
          };
    for (const auto &[name, next] : arrows)
        collect(name, all[name]);
    return all;
}

Arrows drawn()
{
    std::ifstream file(PENWICK_SOURCE_TREE "/docs/house.svg");
    const std::string picture { std::istreambuf_iterator<char>(file), {} };
    const std::regex title("<title>(\\w+)(?:&#45;&gt;(\\w+))?</title>");
    Arrows arrows;
    for (std::sregex_iterator found(picture.begin(), picture.end(), title), end; found != end;
         ++found) {
        auto &from = arrows[(*found)[1]];
        if ((*found)[2].matched)
            from.insert((*found)[2]);
    }
    arrows.erase("house"); // the whole picture's own
    return arrows;
}

Arrows told()
{
    static const SourceTree tree(PENWICK_SOURCE_TREE);
    Arrows arrows;
    for (const auto &[name, module] : tree.modules())
        arrows[name] = module.depends;
    return arrows;
}

} // namespace

TEST(HousePicture, showsWhoStandsUponWhom)
{
    EXPECT_EQ(reached(drawn()), reached(told())) << "scripts/house > docs/house.svg draws it anew";
}

} // namespace penwick::test
