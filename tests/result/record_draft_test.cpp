#include "result/record_draft.h"

#include "support/printing.h"

#include <gtest/gtest.h>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

// A draft is put back only where the fingerprint is the same: two of these must never share one.
TEST(Fingerprint, IsAnotherForEveryOtherRecord)
{
    const QString textTag = QString::number(int(ValueTag::Text));
    const struct {
        const char* what;
        QStringList names;
        std::vector<Value> values;
    } rows[] = {
        {"nothing", {u"A"_s}, {Value::Null()}},
        {"an empty text", {u"A"_s}, {Value::Text(QString())}},
        {"a number", {u"A"_s}, {Value::Integer(5)}},
        {"a number of another type", {u"A"_s}, {Value::Double(5)}},
        {"the text of a number", {u"A"_s}, {Value::Text(u"5"_s)}},
        {"the bytes of a text", {u"A"_s}, {Value::Binary("5")}},
        {"a fraction", {u"A"_s}, {Value::Double(5.25)}},
        {"another fraction", {u"A"_s}, {Value::Double(5.75)}},
        {"a date", {u"A"_s}, {Value::Date(5.25)}},
        {"another field", {u"B"_s}, {Value::Integer(5)}},
        {"two texts", {u"A"_s, u"B"_s}, {Value::Text(u"ab"_s), Value::Text(u"c"_s)}},
        {"parted elsewhere", {u"A"_s, u"B"_s}, {Value::Text(u"a"_s), Value::Text(u"bc"_s)}},
        {"what lies between two texts, in the first of them",
         {u"A"_s, u"B"_s},
         {Value::Text(u'a' + textTag + u'b'), Value::Text(u"c"_s)}},
        {"in the second", {u"A"_s, u"B"_s}, {Value::Text(u"a"_s), Value::Text(u'b' + textTag + u'c')}},
        {"names parted elsewhere", {u"AB"_s, QString()}, {Value::Text(u"ab"_s), Value::Text(u"c"_s)}},
    };
    QHash<QByteArray, const char*> known;
    for (const auto& row : rows) {
        std::vector<ResultField> fields;
        for (const QString& name : row.names)
            fields.emplace_back().name = name;
        const QByteArray fingerprint = FingerprintOf(fields, row.values);
        EXPECT_EQ(FingerprintOf(fields, row.values), fingerprint) << row.what;
        EXPECT_FALSE(known.contains(fingerprint)) << row.what << " and " << known.value(fingerprint);
        known.insert(fingerprint, row.what);
    }
}

} // namespace
} // namespace mirel
