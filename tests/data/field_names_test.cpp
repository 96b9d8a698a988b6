#include "data/catalog.h"
#include "data/field_names.h"
#include "support/printing.h"

#include <gtest/gtest.h>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

TEST(FieldNames, BecomeTheClausesOfTheDatabase)
{
    const struct {
        QString name;
        QString clause;
    } rows[] = {
        {u"Text"_s, u"Varchar(40)"_s},
        {u"Memo"_s, u"Text"_s},
        {u"SmallInt"_s, u"Smallint"_s},
        {u"Double"_s, u"Float"_s},
        {u"Boolean"_s, u"Bit"_s},
        {u"Yes/No"_s, u"Bit"_s},
        {u"VarBinary"_s, u"Varbinary(255)"_s},
        {u"OLEObject"_s, u"Long Varbinary"_s},
        {u"text"_s, u"Text"_s},
        {u""_s, u"Text"_s},
    };
    for (const auto& row : rows)
        EXPECT_EQ(DdlTypeOfName(row.name, 40), row.clause) << row.name.toStdString();
}

TEST(FieldNames, LeaveUnknownTypesWithoutAName)
{
    for (const int code : {0, 6, 72, 206}) {
        QString name = u"before"_s;
        EXPECT_FALSE(TypeNameOfField(FieldType(code), name)) << code;
        EXPECT_EQ(name, u"before"_s) << code;
    }
}

TEST(FieldReference, BracketsWhatCouldNotStandBare)
{
    const struct {
        const char* what;
        QString name;
        QString reference;
    } rows[] = {
        {"plain", u"Ship_Name2"_s, u"Ship_Name2"_s},
        {"letters of any language", u"Größe"_s, u"[Größe]"_s},
        {"first letter beyond A to Z", u"Ärger"_s, u"[Ärger]"_s},
        {"blank", u"Ship Name"_s, u"[Ship Name]"_s},
        {"digit in front", u"2nd"_s, u"[2nd]"_s},
        {"underscore in front", u"_id"_s, u"[_id]"_s},
        {"sign", u"Cost$"_s, u"[Cost$]"_s},
        {"reserved word in any case", u"Order"_s, u"[Order]"_s},
        {"word that only begins so", u"Orders"_s, u"Orders"_s},
        {"bracketed already", u"[Ship Name]"_s, u"[Ship Name]"_s},
        {"all columns", u"*"_s, u"*"_s},
        {"empty", u""_s, u""_s},
    };
    for (const auto& row : rows)
        EXPECT_EQ(FieldReference(row.name), row.reference) << row.what;
}

TEST(QuoteText, DoublesQuotes)
{
    EXPECT_EQ(QuoteText(u"O'Brien's \"%1\""), u"'O''Brien''s \"%1\"'"_s);
}

} // namespace
} // namespace mirel
