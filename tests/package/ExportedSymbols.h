// SPDX-License-Identifier: MIT
// The names that a shared library shows to others, held against a list of allowed families.
#pragma once

#include <QString>
#include <QStringList>

namespace penwick::test {

/// A list of allowed families of names: a class with all that belongs to it, a function with its
/// overloads, a piece of data. exported-symbols.txt tells the form.
class AllowedSymbols final
{
public:
    /// Reads `text`; a line that is none of the forms becomes a family that nothing belongs to.
    explicit AllowedSymbols(const QString &text);

    /// The lines themselves, without remarks, in their order.
    [[nodiscard]] const QStringList &families() const { return m_families; }
    /// The first family that `symbol`, a demangled name, belongs to; empty where none has it.
    [[nodiscard]] QString familyOf(const QString &symbol) const;

private:
    QStringList m_families;
};

/// The demangled names in `listing`, the output of "nm -C": one symbol a line, its address and a
/// letter for its kind before it. In the order given.
[[nodiscard]] QStringList symbolsIn(const QString &listing);

} // namespace penwick::test
