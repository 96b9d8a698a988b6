#include "provider/sqlite/record_feed.h"

namespace mirel::sqlite {
namespace {

constexpr size_t kMostRecords = 64;            // more gain nothing
constexpr size_t kMostBytes = size_t(1) << 18; // wide records are inserted sooner

QByteArray NextName()
{
    static quint64 last = 0;
    return "mirel_feed_" + QByteArray::number(++last);
}

} // namespace

struct RecordFeed::Source : sqlite3_vtab {
    explicit Source(const RecordFeed& of)
        : sqlite3_vtab{}
        , feed(of)
    {
    }
    const RecordFeed& feed;

    struct Cursor : sqlite3_vtab_cursor {
        Cursor()
            : sqlite3_vtab_cursor{}
        {
        }
        size_t record = 0;
    };

    static const RecordFeed& FeedOf(sqlite3_vtab_cursor* cursor)
    {
        return static_cast<Source*>(cursor->pVtab)->feed;
    }
    static size_t& RecordOf(sqlite3_vtab_cursor* cursor) { return static_cast<Cursor*>(cursor)->record; }

    static int Connect(sqlite3* handle, void* context, int, const char* const*, sqlite3_vtab** table, char**)
    {
        const auto& feed = *static_cast<const RecordFeed*>(context);
        sqlite3_vtab_config(handle, SQLITE_VTAB_DIRECTONLY);
        QByteArray columns;
        for (size_t i = 0; i < feed.width_; ++i)
            columns += (i == 0 ? "c" : ",c") + QByteArray::number(qulonglong(i));
        const int result = sqlite3_declare_vtab(handle, "CREATE TABLE x(" + columns + ')');
        if (result == SQLITE_OK)
            *table = new Source(feed);
        return result;
    }
    static int Disconnect(sqlite3_vtab* table)
    {
        delete static_cast<Source*>(table);
        return SQLITE_OK;
    }
    static int BestIndex(sqlite3_vtab*, sqlite3_index_info*) { return SQLITE_OK; }
    static int OpenCursor(sqlite3_vtab*, sqlite3_vtab_cursor** cursor)
    {
        *cursor = new Cursor;
        return SQLITE_OK;
    }
    static int CloseCursor(sqlite3_vtab_cursor* cursor)
    {
        delete static_cast<Cursor*>(cursor);
        return SQLITE_OK;
    }
    static int Filter(sqlite3_vtab_cursor* cursor, int, const char*, int, sqlite3_value**)
    {
        RecordOf(cursor) = 0;
        return SQLITE_OK;
    }
    static int Next(sqlite3_vtab_cursor* cursor)
    {
        ++RecordOf(cursor);
        return SQLITE_OK;
    }
    static int IsAtEnd(sqlite3_vtab_cursor* cursor) { return RecordOf(cursor) >= FeedOf(cursor).Waiting(); }
    static int ColumnOf(sqlite3_vtab_cursor* cursor, sqlite3_context* result, int column);
    static int RowIdOf(sqlite3_vtab_cursor* cursor, sqlite3_int64* rowId)
    {
        *rowId = sqlite3_int64(RecordOf(cursor));
        return SQLITE_OK;
    }
    static const sqlite3_module kModule;
};

// No xCreate: it is there under its module's name, and no other table can be made of it.
const sqlite3_module RecordFeed::Source::kModule = [] {
    sqlite3_module module{};
    module.xConnect = Connect;
    module.xBestIndex = BestIndex;
    module.xDisconnect = Disconnect;
    module.xDestroy = Disconnect;
    module.xOpen = OpenCursor;
    module.xClose = CloseCursor;
    module.xFilter = Filter;
    module.xNext = Next;
    module.xEof = IsAtEnd;
    module.xColumn = ColumnOf;
    module.xRowid = RowIdOf;
    return module;
}();

int RecordFeed::Source::ColumnOf(sqlite3_vtab_cursor* cursor, sqlite3_context* result, int column)
{
    const RecordFeed& feed = FeedOf(cursor);
    const Fed& cell = feed.cells_[RecordOf(cursor) * feed.width_ + size_t(column)];
    switch (cell.kind) {
    case Cell::Kind::Null:
        break;
    case Cell::Kind::Integer:
        sqlite3_result_int64(result, cell.integer);
        break;
    case Cell::Kind::Real:
        sqlite3_result_double(result, cell.real);
        break;
    case Cell::Kind::Text:
        sqlite3_result_text64(result, feed.bytes_.data() + cell.integer, cell.size, SQLITE_STATIC, SQLITE_UTF8);
        break;
    case Cell::Kind::Binary:
        sqlite3_result_blob64(result, feed.bytes_.data() + cell.integer, cell.size, SQLITE_STATIC);
        break;
    }
    return SQLITE_OK;
}

RecordFeed::RecordFeed(DatabaseFile& file)
    : file_(file)
    , name_(NextName())
{
}

RecordFeed::~RecordFeed()
{
    insert_.reset();
    if (isRegistered_ && file_.IsOpen()) // else the table went with the handle
        sqlite3_create_module_v2(file_.Handle(), name_.constData(), nullptr, nullptr, nullptr);
}

Outcome RecordFeed::Open(const QByteArray& table, const std::vector<QByteArray>& columns)
{
    width_ = columns.size();
    int result = sqlite3_create_module_v2(file_.Handle(), name_.constData(), &Source::kModule, this, nullptr);
    if (result != SQLITE_OK)
        return file_.OutcomeOf(result);
    isRegistered_ = true;
    QByteArray names;
    for (const QByteArray& column : columns)
        names += (names.isEmpty() ? "" : ",") + column;
    const QByteArray sql = "INSERT INTO " + table + '(' + names + ") SELECT * FROM " + name_;
    sqlite3_stmt* raw = nullptr;
    result = sqlite3_prepare_v3(file_.Handle(), sql.constData(), int(sql.size()), SQLITE_PREPARE_PERSISTENT, &raw,
                                nullptr);
    insert_.reset(raw);
    return file_.OutcomeOf(result);
}

void RecordFeed::Put(const Cell& cell)
{
    const bool hasBytes = cell.kind == Cell::Kind::Text || cell.kind == Cell::Kind::Binary;
    cells_.push_back({cell.kind, hasBytes ? qint64(bytes_.size()) : cell.integer, cell.real, cell.bytes.size()});
    bytes_ += cell.bytes;
}

bool RecordFeed::IsFull() const
{
    return Waiting() >= kMostRecords || bytes_.size() >= kMostBytes;
}

Outcome RecordFeed::Insert()
{
    if (cells_.empty())
        return {};
    const int result = sqlite3_step(insert_.get());
    const Outcome outcome = file_.OutcomeOf(result);
    sqlite3_reset(insert_.get());
    cells_.clear();
    bytes_.clear();
    return outcome;
}

} // namespace mirel::sqlite
