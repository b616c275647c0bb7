// SPDX-License-Identifier: MIT
#include "package/ExportedSymbols.h"

#include <QRegularExpression>

namespace penwick::test {

namespace {

// Whether `symbol` is a member of the class `name`, one of its tables, or a thunk to a member.
// Nested types with names of their own are members; internal ones are told by their name.
bool belongsToClass(QString symbol, const QString &name)
{
    static const QRegularExpression thunk(
        QStringLiteral("^(non-virtual|virtual|covariant return) thunk to "));
    static const QRegularExpression table(
        QStringLiteral("^(vtable|typeinfo|typeinfo name|VTT) for "));
    const auto tableMatch = table.match(symbol);
    if (tableMatch.hasMatch())
        return symbol.mid(tableMatch.capturedLength()) == name;
    symbol.remove(thunk);
    const QString member = name + QStringLiteral("::");
    return symbol.startsWith(member) && !symbol.startsWith(member + QStringLiteral("Private"));
}

} // namespace

AllowedSymbols::AllowedSymbols(const QString &text)
{
    for (const QString &line : text.split(QLatin1Char('\n'))) {
        const QString family = line.section(QLatin1Char('#'), 0, 0).trimmed();
        if (!family.isEmpty())
            m_families.append(family);
    }
}

QString AllowedSymbols::familyOf(const QString &symbol) const
{
    for (const QString &family : m_families) {
        const QString kind = family.section(QLatin1Char(' '), 0, 0);
        const QString name = family.section(QLatin1Char(' '), 1);
        const bool isMember = kind == QStringLiteral("class") ? belongsToClass(symbol, name)
            : kind == QStringLiteral("function") ? symbol.startsWith(name + QLatin1Char('('))
            : kind == QStringLiteral("data")     ? symbol == name
                                                 : false;
        if (isMember)
            return family;
    }
    return {};
}

QStringList symbolsIn(const QString &listing)
{
    static const QRegularExpression line(
        QStringLiteral("^[0-9a-fA-F]+ +[A-Za-z] (.+)$"), QRegularExpression::MultilineOption);
    QStringList symbols;
    auto matches = line.globalMatch(listing);
    while (matches.hasNext())
        symbols.append(matches.next().captured(1));
    return symbols;
}

} // namespace penwick::test
