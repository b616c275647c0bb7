// SPDX-License-Identifier: MIT
// The dynamic symbol table of the installed library.
#include "package/ExportedSymbols.h"
#include "package/InstalledPackage.h"

#include <gtest/gtest.h>

#include <QFile>

namespace penwick::test {

namespace {

class ExportedSymbols : public testing::Test
{
protected:
    void SetUp() override
    {
        const InstalledPackage &package = InstalledPackage::shared();
        ASSERT_EQ(package.complaint().toStdString(), "");
        const Ending ending = run(QStringLiteral(PENWICK_NM),
            { QStringLiteral("-DC"), QStringLiteral("--defined-only"),
                package.libraryFolder() + QStringLiteral("/libpenwick.so") });
        ASSERT_EQ(ending.status, 0) << ending.errors.toStdString();
        symbols = symbolsIn(ending.output);
        ASSERT_EQ(symbols.size(), ending.output.count(QLatin1Char('\n'))) << "a line was not read";
    }

    static AllowedSymbols allowed()
    {
        QFile file(QStringLiteral(PENWICK_ALLOWED_SYMBOLS));
        EXPECT_TRUE(file.open(QIODevice::ReadOnly));
        return AllowedSymbols(QString::fromUtf8(file.readAll()));
    }

    QStringList symbols;
};

} // namespace

TEST_F(ExportedSymbols, areOnlyThoseOfTheAllowedFamilies)
{
    const AllowedSymbols list = allowed();
    QStringList strangers;

    for (const QString &symbol : symbols) {
        if (list.familyOf(symbol).isEmpty())
            strangers.append(symbol);
    }

    EXPECT_EQ(strangers.join(QLatin1Char('\n')).toStdString(), "");
}

TEST_F(ExportedSymbols, everyAllowedFamilyHasOne)
{
    const AllowedSymbols list = allowed();
    QStringList missing = list.families();

    for (const QString &symbol : symbols)
        missing.removeAll(list.familyOf(symbol));

    EXPECT_EQ(missing.join(QLatin1Char('\n')).toStdString(), "");
}

TEST(AllowedSymbols, classHasItsMembersTablesAndThunksAndNothingElse)
{
    const AllowedSymbols list(QStringLiteral("class a::B # why\n"));

    for (const char *const symbol : { "a::B::B()", "a::B::m(int) const", "a::B::staticMetaObject",
             "vtable for a::B", "typeinfo name for a::B", "non-virtual thunk to a::B::~B()" })
        EXPECT_EQ(list.familyOf(QString::fromLatin1(symbol)), QStringLiteral("class a::B"))
            << symbol;
    for (const char *const symbol : { "a::Bc::m()", "a::C::m()", "vtable for a::Bc",
             "typeinfo for std::X<a::B>", "a::B::Private::m()", "vtable for a::B::Private",
             "std::vector<a::B>::clear()", "x::a::B::m()" })
        EXPECT_EQ(list.familyOf(QString::fromLatin1(symbol)), QString()) << symbol;
}

TEST(AllowedSymbols, functionHasItsOverloadsAndDataItself)
{
    const AllowedSymbols list(QStringLiteral("function a::f\ndata D\n"));

    EXPECT_EQ(list.familyOf(QStringLiteral("a::f(int)")), QStringLiteral("function a::f"));
    EXPECT_EQ(list.familyOf(QStringLiteral("a::f2(int)")), QString());
    EXPECT_EQ(list.familyOf(QStringLiteral("D")), QStringLiteral("data D"));
    EXPECT_EQ(list.familyOf(QStringLiteral("D2")), QString());
}

} // namespace penwick::test
