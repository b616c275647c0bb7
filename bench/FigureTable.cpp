// SPDX-License-Identifier: MIT
#include "FigureTable.h"

#include <array>
#include <charconv>
#include <cstdio>
#include <sstream>

namespace penwick::bench {

namespace {

constexpr const char *rowFormat = "| %-64s | %5s | %11s | %11s | %11s | %7s | %-27s | %-3s |\n";

std::string fixed(double value, int decimals)
{
    std::array<char, 64> text {};
    std::snprintf(text.data(), text.size(), "%.*f", decimals, value);
    return text.data();
}

// The shortest text that is read as the same number again.
std::string exactOrDash(const std::optional<double> &value)
{
    std::array<char, 64> text {};
    if (!value)
        return "-";
    return { text.data(), std::to_chars(text.begin(), text.end(), *value).ptr };
}

std::string ratioOrDash(const std::optional<double> &ratio)
{
    return ratio ? fixed(*ratio, 2) : "-";
}

std::optional<double> numberFrom(const std::string &text)
{
    double value = 0.0;
    const auto end = text.data() + text.size();
    if (std::from_chars(text.data(), end, value).ptr != end || text.empty())
        return std::nullopt;
    return value;
}

// Three digits that mean something, whatever the size.
std::string amount(double value, const std::string &unit)
{
    if (unit == "us" && value >= 1000.0)
        return amount(value / 1000.0, "ms");
    const bool isWhole = value >= 100.0 || value == 0.0;
    const int decimals = isWhole ? 0 : value >= 10.0 ? 1 : 2;
    return fixed(value, decimals) + (unit.empty() ? "" : " " + unit);
}

std::string amountOrDash(const std::optional<double> &value, const std::string &unit)
{
    return value ? amount(*value, unit) : "-";
}

std::string targetOf(const Figure &figure)
{
    const auto &[most, mostTimes] = figure.target;
    std::string text;
    if (most)
        text = "<= " + amount(*most, figure.unit);
    if (mostTimes)
        text += std::string(most ? " or " : "") + "<= " + fixed(*mostTimes, 2) + " times";
    return text.empty() ? "-" : text;
}

} // namespace

std::string lineOf(const ScaledFigure &scaled)
{
    const Figure &figure = scaled.figure;
    std::string line = std::to_string(scaled.scale) + '\t' + figure.name + '\t' + figure.unit;
    for (const auto &value : { std::optional(figure.measured), figure.against, figure.target.most,
             figure.target.mostTimes, figure.wall })
        line += '\t' + exactOrDash(value);
    return line;
}

std::optional<ScaledFigure> figureFrom(const std::string &line)
{
    constexpr std::size_t fieldCount = 8;
    std::vector<std::string> fields;
    std::istringstream stream(line);
    for (std::string field; std::getline(stream, field, '\t');)
        fields.push_back(field);
    if (fields.size() != fieldCount)
        return std::nullopt;
    const auto scale = numberFrom(fields[0]);
    const auto measured = numberFrom(fields[3]);
    if (!scale || !measured)
        return std::nullopt;
    return ScaledFigure { static_cast<int>(*scale),
        { fields[1], fields[2], *measured, numberFrom(fields[4]),
            { numberFrom(fields[5]), numberFrom(fields[6]) }, numberFrom(fields[7]) } };
}

bool printTable(const std::vector<ScaledFigure> &figures)
{
    bool areAllMet = true;
    std::printf(
        rowFormat, "what", "scale", "measured", "wall clock", "against", "ratio", "target", "met");
    std::printf("|---|--:|--:|--:|--:|--:|---|---|\n");
    for (const auto &[scale, figure] : figures) {
        const auto met = isMet(figure);
        areAllMet = areAllMet && met.value_or(true);
        std::printf(rowFormat, figure.name.c_str(), std::to_string(scale).c_str(),
            amount(figure.measured, figure.unit).c_str(), amountOrDash(figure.wall, "us").c_str(),
            amountOrDash(figure.against, figure.unit).c_str(), ratioOrDash(ratioOf(figure)).c_str(),
            targetOf(figure).c_str(),
            !met       ? "-"
                : *met ? "yes"
                       : "NO");
    }
    return areAllMet;
}

} // namespace penwick::bench
