// Any bytes as a database file: opened, listed, read at every kind of cursor, then changed. Refusing is fine; a
// file that was only read must keep its bytes, and no position may lie behind the count.
#include "provider/provider.h"

#include <QFile>
#include <QStringList>
#include <QTemporaryDir>

#include <sqlite3.h>

#include <array>
#include <cstdint>
#include <cstdlib>

using namespace mirel;
using namespace Qt::StringLiterals;

namespace {

constexpr size_t kMostBytes = 256 << 10;
constexpr qsizetype kMostTables = 12;
constexpr int kPage = 30;

// A damaged tree or a view can have more rows than can ever be read. So that each input takes a bounded time,
// the engine gives up after some steps, as it does where a user interrupts it.
constexpr int kStepsAtOnce = 10'000;
constexpr int kMostStepsAtOnce = 100;
int stepsTaken = 0;

int GiveUp(void*)
{
    return ++stepsTaken > kMostStepsAtOnce ? 1 : 0;
}

int LimitSteps(sqlite3* handle, char**, const void*)
{
    sqlite3_progress_handler(handle, kStepsAtOnce, GiveUp, nullptr);
    return SQLITE_OK;
}

// The file of each input in turn, in a folder of its own.
class InputFile {
public:
    explicit InputFile(QByteArrayView bytes)
    {
        QFile file(Path());
        if (!file.open(QIODevice::WriteOnly) || file.write(bytes.data(), bytes.size()) != bytes.size())
            std::abort();
    }
    ~InputFile()
    {
        for (const auto* suffix : {"", "-journal", "-wal", "-shm"})
            QFile::remove(Path() + QLatin1String(suffix));
    }
    Q_DISABLE_COPY_MOVE(InputFile)

    static QString Path()
    {
        static const QTemporaryDir folder;
        return folder.filePath(u"input.cdb"_s);
    }
    static QByteArray Bytes()
    {
        QFile file(Path());
        return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
    }
};

void Require(bool holds)
{
    if (!holds)
        __builtin_trap();
}

QStringList FirstColumn(ProviderConnection& provider, const QString& source)
{
    QStringList texts;
    const auto rows = provider.CreateRecordset();
    if (Failed(rows->Open(source, InputFile::Path(), CursorType::ForwardOnly, LockType::ReadOnly)))
        return {};
    Value value;
    while (!rows->AtEnd() && texts.size() < 1000 && !Failed(rows->GetValue(0, value))) {
        texts += value.ToText();
        if (Failed(rows->MoveNext()))
            break;
    }
    return texts;
}

void ReadPage(ProviderRecordset& rows, qint64 first)
{
    int left = kPage;
    (void)rows.Read({.first = first, .count = kPage, .fields = {}}, [&left](std::span<const Cell> cells) {
        size_t size = 0;
        for (const Cell& cell : cells)
            size += cell.bytes.size() + (cell.bytes.empty() ? 0 : size_t(cell.bytes.back() & 1));
        return --left > 0 && size < (1 << 20);
    });
    Require(left >= 0);
}

void ReadValues(ProviderRecordset& rows)
{
    Value value;
    for (int field = 0; field < int(rows.Fields().size()); ++field)
        (void)rows.GetValue(field, value);
}

void ReadStatic(ProviderRecordset& rows)
{
    ReadValues(rows);
    ReadPage(rows, 0);
    (void)rows.CountStep(0);
    const Hr moved = rows.MoveLast();
    ReadValues(rows);
    const qint64 count = rows.RecordCount();
    Require(rows.Position() < count || count < 0 || rows.Position() < 0);
    if (!Failed(moved) && count > 0)
        ReadPage(rows, count / 2);
    (void)rows.MovePrevious();
    (void)rows.MoveTo(count / 3);
    Require(rows.Position() <= count);
    ReadValues(rows);
}

void ReadForward(ProviderRecordset& rows)
{
    for (int i = 0; i < 300 && !rows.AtEnd(); ++i) {
        ReadValues(rows);
        if (Failed(rows.MoveNext()))
            return;
    }
    ReadPage(rows, 0);
}

void Read(ProviderConnection& provider, const QString& source)
{
    const auto rows = provider.CreateRecordset();
    if (!Failed(rows->Open(source, InputFile::Path(), CursorType::Static, LockType::Optimistic)))
        ReadStatic(*rows);
    if (!Failed(rows->Open(source, InputFile::Path(), CursorType::ForwardOnly, LockType::ReadOnly)))
        ReadForward(*rows);
}

QString FirstField(ProviderConnection& provider, const QString& table)
{
    const auto rows = provider.CreateRecordset();
    if (Failed(rows->Open(table, InputFile::Path(), CursorType::ForwardOnly, LockType::ReadOnly)))
        return {};
    const std::span<const ResultField> fields = rows->Fields();
    return fields.empty() ? QString() : u'[' + fields.front().name + u']';
}

void ReadTable(ProviderConnection& provider, const QString& table)
{
    Read(provider, table);
    const QString field = FirstField(provider, table);
    const QString select = u"SELECT * FROM "_s + table;
    for (const auto& rest : {u" ORDER BY %1 DESC"_s, u" WHERE %1 LIKE '%a%'"_s, u" WHERE %1>'2001-07-04'"_s})
        Read(provider, select + rest.arg(field));
    Read(provider, u"SELECT DISTINCT %1 FROM %2"_s.arg(field, table));
}

void ChangeRecords(ProviderConnection& provider, const QString& table)
{
    const auto rows = provider.CreateRecordset();
    if (Failed(rows->Open(table, InputFile::Path(), CursorType::Static, LockType::Optimistic)))
        return;
    Value value;
    if (!Failed(rows->GetValue(0, value))) {
        const std::array change{FieldChange{0, value}};
        (void)rows->Update(change);
        (void)rows->AddNew(change, {});
    }
    (void)rows->AddNew({}, {});
    (void)rows->MoveFirst();
    (void)rows->Delete();
    ReadStatic(*rows);
    (void)rows->UpdateAll(0, Value::Text(u"1"_s), -1, {});
    (void)rows->DeleteAll(-1, [](qint64) { return false; });
    ReadStatic(*rows);
}

void ChangeStructure(ProviderConnection& provider, const QString& table)
{
    const QString field = FirstField(provider, table);
    const auto statement = provider.CreateRecordset();
    for (const QString& change :
         {u"ALTER TABLE %1 ADD [new] Varchar(9)"_s.arg(table),
          u"ALTER TABLE %1 MOVE [new] BEFORE %2"_s.arg(table, field),
          u"ALTER TABLE %1 RENAME %2 TO [renamed]"_s.arg(table, field),
          u"CREATE INDEX [i] ON %1 ([new] DESC)"_s.arg(table), u"ALTER TABLE %1 to [other name]"_s.arg(table),
          u"ALTER TABLE [other name] DROP [renamed]"_s, u"DROP TABLE [other name]"_s})
        (void)statement->Open(change, InputFile::Path(), CursorType::ForwardOnly, LockType::ReadOnly);
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    if (size > kMostBytes)
        return 0;
    static const int limited = sqlite3_auto_extension(reinterpret_cast<void (*)()>(LimitSteps));
    Require(limited == SQLITE_OK);
    stepsTaken = 0;
    const QByteArrayView bytes(data, qsizetype(size));
    const InputFile file(bytes);
    const auto provider = CreateProvider(u"cedb");
    QStringList tables;
    for (const QString& name : FirstColumn(*provider, u"SELECT TableName FROM MSysTables"_s))
        tables += u'[' + name + u']';
    tables.resize(std::min(tables.size(), kMostTables));
    for (const QString& table : std::as_const(tables))
        ReadTable(*provider, table);
    provider->CloseDatabase(InputFile::Path());
    Require(InputFile::Bytes() == bytes);
    for (const QString& table : std::as_const(tables)) {
        stepsTaken = 0;
        ChangeRecords(*provider, table);
        ChangeStructure(*provider, table);
    }
    return 0;
}
