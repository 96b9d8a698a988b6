#include "data/provider_error.h"

#include "resources/string_table.h"
#include "support/test_database.h"

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

const QString kReadOnlyJoin = StringText(Str::ErrorReadOnlyJoin);
const QString kInCommand = StringText(Str::ErrorInCommand);

TEST(ProviderErrorText, NamesCodeContextAndMessage)
{
    EXPECT_EQ(ProviderErrorText(nullptr, Hr::NoSuchTable, {}),
              u"Error: (80040E37)\r\nThe specified table does not exist"_s);
    EXPECT_EQ(ProviderErrorText(nullptr, Hr(0x80040E34), u"the field \"Qty\" %1"_s),
              u"Error: (80040E34) the field \"Qty\" %1\r\nThe specified index already exists"_s);
    EXPECT_EQ(ProviderErrorText(nullptr, Hr(0x800A0F08), {}),
              ProviderErrorText(nullptr, Hr(0x80040E40), {}).replace(u"80040E40"_s, u"800A0F08"_s));
    EXPECT_TRUE(ProviderErrorText(nullptr, Hr(0x80000001), {}).endsWith(kInCommand));
}

class ProviderErrorOfResult : public TestDatabase {
protected:
    ProviderErrorOfResult()
    {
        Run(u"CREATE TABLE People (Id Integer, Name Varchar(40))"_s);
        Run(u"CREATE TABLE [Join] (Id Integer, Town Varchar(40))"_s);
    }
    // The message for a code that stands in no table.
    QString MessageFor(const QString& source, LockType lock)
    {
        DbRecordset recordset(connection_);
        EXPECT_TRUE(Open(recordset, source, lock)) << source.toStdString();
        return ProviderErrorText(&recordset, Hr(0x80000001), {}).section(u"\r\n"_s, 1);
    }
};

TEST_F(ProviderErrorOfResult, TellsAReadOnlyJoinFromAFaultyCommand)
{
    const QString both = u"SELECT * FROM People inner join [Join] ON People.Id=[Join].Id"_s;
    EXPECT_EQ(MessageFor(both, LockType::ReadOnly), kReadOnlyJoin);
    EXPECT_EQ(MessageFor(both, LockType::Optimistic), kReadOnlyJoin) << "cannot be updated whatever was asked";
    EXPECT_EQ(MessageFor(QString(both).replace(u" inner join "_s, u"\r\nINNER JOIN\r\n"_s), LockType::ReadOnly),
              kReadOnlyJoin);
    EXPECT_EQ(MessageFor(u"SELECT * FROM [Join]"_s, LockType::ReadOnly), kInCommand) << "a name";
    EXPECT_EQ(MessageFor(u"SELECT * FROM People WHERE Name=' join '"_s, LockType::ReadOnly), kInCommand)
        << "a text";
}

TEST_F(ProviderErrorOfResult, SaysItsContextWhereTheMessageLeavesItOpen)
{
    DbRecordset recordset(connection_);
    EXPECT_FALSE(Open(recordset, u"SELECT * FORM People"_s));
    ReportProviderError(prompt_, &recordset, recordset.LastResult());
    ASSERT_EQ(prompt_.shown.size(), 1);
    EXPECT_FALSE(recordset.ErrorContext().isEmpty());
    EXPECT_EQ(prompt_.shown[0], u"Error: (80040E14) "_s + recordset.ErrorContext() + u"\r\n"_s + kInCommand);

    EXPECT_FALSE(Open(recordset, u"SELECT * FROM Nobody"_s));
    ReportProviderError(prompt_, &recordset, recordset.LastResult());
    EXPECT_EQ(prompt_.shown.last(), u"Error: (80040E37)\r\nThe specified table does not exist"_s);

    ReportProviderError(prompt_, &recordset, Hr::Ok);
    EXPECT_EQ(prompt_.shown.size(), 2);
}

TEST_F(ProviderErrorOfResult, TellsAFaultInAJoinByItsPlace)
{
    DbRecordset recordset(connection_);
    EXPECT_FALSE(Open(recordset, u"SELECT * FROM People JOIN [Join] ONN 1=1"_s, LockType::ReadOnly));
    ReportProviderError(prompt_, &recordset, recordset.LastResult());
    EXPECT_EQ(prompt_.shown, QStringList(u"Error: (80040E14) at character 38, near \"1\"\r\n"_s + kInCommand));
}

TEST_F(ProviderErrorOfResult, SaysWhyAResultRefusesAChange)
{
    const struct {
        QString source;
        LockType lock;
        Str reason;
        QString name;
    } rows[] = {
        {u"People"_s, LockType::ReadOnly, Str::OpenedForReading, {}},
        {u"MSysTables"_s, LockType::Optimistic, Str::CatalogTableIsReadOnly, u"MSysTables"_s},
        {u"SELECT DISTINCT Name FROM People"_s, LockType::Optimistic, Str::DistinctIsReadOnly, {}},
        {u"SELECT Name FROM People GROUP BY Name"_s, LockType::Optimistic, Str::GroupsAreReadOnly, {}},
        {u"SELECT 1+1"_s, LockType::Optimistic, Str::ComputedIsReadOnly, {}},
        {u"SELECT * FROM People p INNER JOIN [Join] t ON p.Id=t.Id"_s,
         LockType::Optimistic,
         Str::JoinIsReadOnly,
         {}},
    };
    for (const auto& row : rows) {
        DbRecordset recordset(connection_);
        ASSERT_TRUE(Open(recordset, row.source, row.lock)) << row.source.toStdString();
        EXPECT_FALSE(recordset.Delete());
        EXPECT_EQ(recordset.LastResult(), Hr::ReadOnly);
        EXPECT_EQ(recordset.ErrorContext(),
                  row.name.isEmpty() ? StringText(row.reason) : StringText(row.reason, {row.name}));
    }
    Run(u"INSERT INTO People VALUES (1,'x')"_s);
    DbRecordset recordset(connection_);
    ASSERT_TRUE(Open(recordset, u"SELECT Name,Id+1 AS Next FROM People"_s));
    EXPECT_FALSE(recordset.Update(1, Value::Integer(5)));
    EXPECT_EQ(recordset.ErrorContext(), StringText(Str::ColumnIsComputed, {u"Next"_s}));
}

} // namespace
} // namespace mirel
