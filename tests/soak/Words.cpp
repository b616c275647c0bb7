// SPDX-License-Identifier: MIT
#include "soak/Words.h"

#include <sstream>

namespace penwick::test {

std::string inWords(Spot spot)
{
    std::ostringstream words;
    words.precision(12);
    words << ' ' << spot.x << ',' << spot.y;
    return words.str();
}

std::string quoted(const std::string &text)
{
    std::string words = "'";
    for (const char letter : text)
        words += letter == '\n' ? std::string("\\n") : std::string(1, letter);
    return words + "'";
}

Spot spotIn(const std::string &words)
{
    std::istringstream stream(words.substr(words.rfind(' ') + 1));
    Spot spot;
    char comma = ',';
    stream >> spot.x >> comma >> spot.y;
    return spot;
}

std::string textIn(const std::string &words)
{
    const auto begin = words.find('\'') + 1;
    std::string text = words.substr(begin, words.rfind('\'') - begin);
    for (auto end = text.find("\\n"); end != std::string::npos; end = text.find("\\n"))
        text.replace(end, 2, "\n");
    return text;
}

} // namespace penwick::test
