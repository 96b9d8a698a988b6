#include "provider/dialect/structure_parser.h"

#include "provider/dialect/column_types.h"

namespace mirel::dialect {
namespace {

class StructureParser {
public:
    explicit StructureParser(TokenCursor& cursor)
        : cursor_(cursor)
    {
    }

    bool Parse();
    Statement TakeStatement() { return std::move(statement_); }

private:
    bool ParseCreate();
    bool ParseCreateTable();
    bool ParseCreateIndex(bool unique);
    bool ParseDrop();
    bool ParseAlter();
    bool ParseRename(QString table);
    bool ParseMove(QString table);
    bool ParseColumn(ColumnDefinition& column)
    {
        return cursor_.ExpectNewName(column.name) && ParseColumnType(cursor_, column);
    }
    template <typename Change>
    bool Keep(Change change)
    {
        statement_ = StructureChange(std::move(change));
        return true;
    }

    TokenCursor& cursor_;
    Statement statement_;
};

bool StructureParser::Parse()
{
    if (cursor_.Take(Keyword::Create))
        return ParseCreate();
    if (cursor_.Take(Keyword::Drop))
        return ParseDrop();
    return cursor_.Expect(Keyword::Alter) && ParseAlter();
}

bool StructureParser::ParseCreate()
{
    if (cursor_.TakeWord(u"DATABASE")) {
        CreateDatabase create;
        if (!cursor_.ExpectText(create.path))
            return false;
        statement_ = std::move(create);
        return true;
    }
    if (cursor_.TakeWord(u"TABLE"))
        return ParseCreateTable();
    const bool unique = cursor_.TakeWord(u"UNIQUE");
    return cursor_.ExpectWord(u"INDEX") && ParseCreateIndex(unique);
}

bool StructureParser::ParseCreateTable()
{
    CreateTable create;
    if (!cursor_.ExpectNewName(create.table) || !cursor_.Expect(Symbol::Open))
        return false;
    do {
        if (!ParseColumn(create.columns.emplace_back()))
            return false;
    } while (cursor_.Take(Symbol::Comma));
    return cursor_.Expect(Symbol::Close) && Keep(std::move(create));
}

bool StructureParser::ParseCreateIndex(bool unique)
{
    CreateIndex create;
    create.unique = unique;
    if (!cursor_.ExpectNewName(create.index) || !cursor_.Expect(Keyword::On) ||
        !cursor_.ExpectName(create.table) || !cursor_.Expect(Symbol::Open)) {
        return false;
    }
    do {
        auto& [name, descending] = create.columns.emplace_back();
        if (!cursor_.ExpectName(name))
            return false;
        descending = cursor_.Take(Keyword::Desc);
        if (!descending)
            cursor_.Take(Keyword::Asc);
    } while (cursor_.Take(Symbol::Comma));
    return cursor_.Expect(Symbol::Close) && Keep(std::move(create));
}

bool StructureParser::ParseDrop()
{
    if (cursor_.TakeWord(u"DATABASE")) {
        DropDatabase drop;
        if (!cursor_.ExpectText(drop.path))
            return false;
        statement_ = std::move(drop);
        return true;
    }
    if (cursor_.TakeWord(u"TABLE")) {
        DropTable drop;
        return cursor_.ExpectName(drop.table) && Keep(std::move(drop));
    }
    DropIndex drop;
    return cursor_.ExpectWord(u"INDEX") && cursor_.ExpectName(drop.table) && cursor_.Expect(Symbol::Point) &&
           cursor_.ExpectName(drop.index) && Keep(std::move(drop));
}

bool StructureParser::ParseAlter()
{
    QString table;
    if (!cursor_.ExpectWord(u"TABLE") || !cursor_.ExpectName(table))
        return false;
    if (cursor_.TakeWord(u"TO")) {
        RenameTable rename{std::move(table), {}};
        return cursor_.ExpectNewName(rename.newName) && Keep(std::move(rename));
    }
    if (cursor_.TakeWord(u"ADD")) {
        cursor_.TakeWord(u"COLUMN");
        AddColumn add{std::move(table), {}};
        return ParseColumn(add.column) && Keep(std::move(add));
    }
    if (cursor_.Take(Keyword::Drop)) {
        cursor_.TakeWord(u"COLUMN");
        DropColumn drop{std::move(table), {}};
        return cursor_.ExpectName(drop.column) && Keep(std::move(drop));
    }
    if (cursor_.TakeWord(u"RENAME"))
        return ParseRename(std::move(table));
    return cursor_.ExpectWord(u"MOVE") && ParseMove(std::move(table));
}

bool StructureParser::ParseRename(QString table)
{
    if (cursor_.TakeWord(u"TO")) {
        RenameTable rename{std::move(table), {}};
        return cursor_.ExpectNewName(rename.newName) && Keep(std::move(rename));
    }
    cursor_.TakeWord(u"COLUMN");
    RenameColumn rename{std::move(table), {}, {}};
    return cursor_.ExpectName(rename.column) && cursor_.ExpectWord(u"TO") &&
           cursor_.ExpectNewName(rename.newName) && Keep(std::move(rename));
}

bool StructureParser::ParseMove(QString table)
{
    MoveColumn move{std::move(table), {}, {}};
    return cursor_.ExpectName(move.column) && cursor_.ExpectWord(u"BEFORE") && cursor_.ExpectName(move.before) &&
           Keep(std::move(move));
}

} // namespace

ParseResult ParseStructureStatement(TokenCursor& cursor)
{
    StructureParser parser(cursor);
    const bool parsed = parser.Parse();
    cursor.Take(Symbol::Semicolon);
    if (parsed && cursor.Current().kind == TokenKind::End && !cursor.Failed())
        return parser.TakeStatement();
    cursor.Fail();
    return cursor.Fault();
}

} // namespace mirel::dialect
