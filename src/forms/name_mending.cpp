#include "forms/name_mending.h"

#include "data/catalog.h"
#include "data/table_statements.h"
#include "expr/operators.h"
#include "forms/control_source.h"
#include "forms/control_types.h"
#include "provider/dialect/lexer.h"
#include "provider/dialect/parser.h"

#include <QRegularExpression>

#include <algorithm>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;
using dialect::Keyword;
using dialect::Symbol;
using dialect::Token;
using dialect::TokenKind;

bool SameName(QStringView a, QStringView b)
{
    return a.compare(b, Qt::CaseInsensitive) == 0;
}

// --- statements -------------------------------------------------------------------------------------------------

// What a word of a statement stands for.
enum class Role { Other, Table, Alias, ColumnAlias, Qualifier, Column };

struct Word {
    Token token;
    Role role = Role::Other;
    int qualifier = -1; // of a column: the word before its point
    bool late = false;  // behind GROUP, HAVING or ORDER, where names of the result come first
};

struct Source {
    QString table;
    QString alias;
};

// A statement cut into words that know what they stand for. Not a parse: it reads what people have half written,
// too, and never loses the text between the words.
class StatementWords {
public:
    explicit StatementWords(QStringView statement)
    {
        dialect::Lexer lexer(statement);
        for (Token token = lexer.Next(); token.kind != TokenKind::End; token = lexer.Next()) {
            words_.push_back({token});
            if (token.kind == TokenKind::Fault) {
                words_.clear();
                break;
            }
        }
        for (size_t i = 0; i < words_.size(); ++i)
            Read(i);
    }

    const std::vector<Word>& Words() const { return words_; }
    std::vector<Source>& Sources() { return sources_; }
    bool HasColumnAlias(QStringView name) const
    {
        return std::ranges::any_of(words_, [&](const Word& word) {
            return word.role == Role::ColumnAlias && SameName(NameOf(word.token), name);
        });
    }
    static QString NameOf(const Token& token)
    {
        const QString text = token.text.toString();
        return token.kind == TokenKind::BracketedName ? QString(text).replace("]]"_L1, "]"_L1) : text;
    }

private:
    bool IsName(size_t i) const
    {
        return i < words_.size() &&
               (words_[i].token.kind == TokenKind::BracketedName ||
                (words_[i].token.kind == TokenKind::Name && words_[i].token.keyword == Keyword::None));
    }
    bool Is(size_t i, Symbol symbol) const { return i < words_.size() && words_[i].token.symbol == symbol; }
    bool EndsOperand(size_t i) const
    {
        const Token& token = words_[i].token;
        return IsName(i) || token.kind == TokenKind::Text || token.kind == TokenKind::Number ||
               token.symbol == Symbol::Close || token.keyword == Keyword::Null;
    }

    void Read(size_t i);
    void ReadKeyword(Keyword keyword);
    void ReadName(size_t i);

    std::vector<Word> words_;
    std::vector<Source> sources_;
    bool wantsTable_ = false; // behind FROM, JOIN, INTO, UPDATE, and commas between tables
    bool inFrom_ = false;
    bool inColumns_ = false; // the list behind SELECT
    bool late_ = false;
};

void StatementWords::ReadKeyword(Keyword keyword)
{
    wantsTable_ = keyword == Keyword::From || keyword == Keyword::Join || keyword == Keyword::Into ||
                  keyword == Keyword::Update;
    if (keyword == Keyword::From || keyword == Keyword::Join)
        inFrom_ = true;
    else if (keyword != Keyword::As && keyword != Keyword::Inner && keyword != Keyword::Left)
        inFrom_ = false;
    if (keyword == Keyword::Select)
        inColumns_ = true;
    else if (keyword == Keyword::From)
        inColumns_ = false;
    late_ = late_ || keyword == Keyword::Group || keyword == Keyword::Having || keyword == Keyword::Order;
}

void StatementWords::Read(size_t i)
{
    const Token& token = words_[i].token;
    if (IsName(i))
        return ReadName(i);
    if (token.kind == TokenKind::Name)
        return ReadKeyword(token.keyword);
    if (token.symbol == Symbol::Comma && inFrom_)
        wantsTable_ = true;
}

void StatementWords::ReadName(size_t i)
{
    Word& word = words_[i];
    word.late = late_;
    const bool afterAs = i > 0 && words_[i - 1].token.keyword == Keyword::As;
    const size_t before = afterAs ? i - 2 : i - 1; // wraps at the beginning, and is no place then
    if (wantsTable_) {
        word.role = Role::Table;
        sources_.push_back({NameOf(word.token), {}});
        wantsTable_ = false;
    } else if (i > 0 && words_[i - 1].token.symbol == Symbol::Ampersand &&
               words_[i - 1].token.end == word.token.begin && (i < 2 || !EndsOperand(i - 2))) {
        word.role = Role::Other; // a control of the form
    } else if (inFrom_ && before < i && words_[before].role == Role::Table) {
        word.role = Role::Alias;
        sources_.back().alias = NameOf(word.token);
    } else if (Is(i + 1, Symbol::Point)) {
        word.role = Role::Qualifier;
    } else if (i > 1 && Is(i - 1, Symbol::Point) && words_[i - 2].role == Role::Qualifier) {
        word.role = Role::Column;
        word.qualifier = int(i) - 2;
    } else if (inColumns_ && i > 0 && (afterAs || EndsOperand(i - 1))) {
        word.role = Role::ColumnAlias;
    } else if (word.token.kind == TokenKind::BracketedName || !Is(i + 1, Symbol::Open)) {
        word.role = Role::Column;
    }
}

// Whether the words of one statement mean what is renamed.
class StatementMatcher {
public:
    StatementMatcher(StatementWords& words, const NameChange& change)
        : words_(words)
        , change_(change)
        , table_(change.what == NameChange::What::Field ? change.table : change.from)
    {
    }

    bool Matches(const Word& word) const
    {
        const QString name = StatementWords::NameOf(word.token);
        if (!SameName(name, change_.from))
            return false;
        if (change_.what == NameChange::What::Table)
            return word.role == Role::Table || (word.role == Role::Qualifier && MeansTheTable(name));
        if (word.role != Role::Column)
            return false;
        if (word.qualifier >= 0)
            return MeansTheTable(StatementWords::NameOf(words_.Words()[size_t(word.qualifier)].token));
        return ReadsTheTable() && !(word.late && words_.HasColumnAlias(name));
    }

private:
    // Whether a qualifier is the table, by an alias or by its name.
    bool MeansTheTable(const QString& qualifier) const
    {
        const auto source = std::ranges::find_if(words_.Sources(), [&](const Source& each) {
            return SameName(each.alias.isEmpty() ? each.table : each.alias, qualifier);
        });
        if (source == words_.Sources().end())
            return SameName(qualifier, table_);
        // Where the alias is the word, the table's name does not stand here.
        const bool byName = source->alias.isEmpty() || SameName(source->alias, source->table);
        return SameName(source->table, table_) && (byName || change_.what == NameChange::What::Field);
    }
    bool ReadsTheTable() const
    {
        return std::ranges::any_of(words_.Sources(),
                                   [&](const Source& each) { return SameName(each.table, table_); });
    }

    StatementWords& words_;
    const NameChange& change_;
    QString table_;
};

bool ChangesTexts(const NameChange& change)
{
    return change.what == NameChange::What::Table || change.what == NameChange::What::Field;
}

// --- expressions ------------------------------------------------------------------------------------------------

// As expressions find fields: without regard to case and blanks.
bool MeansSame(const QString& written, const QString& name)
{
    return SameName(QString(written).remove(u' '), QString(name).remove(u' '));
}

// A field's name in an expression: the table in front of the last point outside of brackets.
struct FieldWord {
    explicit FieldWord(const QString& text)
    {
        bool inside = false;
        for (qsizetype i = 0; i < text.size(); ++i) {
            if (text[i] == u'[' || text[i] == u']')
                inside = text[i] == u'[';
            else if (text[i] == u'.' && !inside)
                point = i;
        }
        table = text.first(std::max<qsizetype>(point, 0));
        field = text.sliced(point + 1);
    }

    static QString Bare(const QString& name) { return QString(name).remove(u'[').remove(u']'); }
    // `name` in brackets where the written one was.
    static QString Like(const QString& written, const QString& name)
    {
        return written.startsWith(u'[') ? NameInBrackets(name) : FieldReference(name);
    }

    qsizetype point = -1;
    QString table; // as written, with its brackets
    QString field;
};

QString FieldWithNewName(const QString& text, const NameChange& change, bool mayBeBare)
{
    const FieldWord word(text);
    const QString table = FieldWord::Bare(word.table);
    const QString field = FieldWord::Bare(word.field);
    if (change.what == NameChange::What::Table) {
        if (word.point < 0 || !MeansSame(table, change.from))
            return text;
        return FieldWord::Like(word.table, change.to) + u'.' + word.field;
    }
    if (word.point >= 0 && mayBeBare && MeansSame(FieldWord::Bare(text), change.from)) // a point in the name
        return FieldWord::Like(text, change.to);
    if (!MeansSame(field, change.from))
        return text;
    if (word.point < 0)
        return mayBeBare ? FieldWord::Like(word.field, change.to) : text;
    return MeansSame(table, change.table) ? word.table + u'.' + FieldWord::Like(word.field, change.to) : text;
}

// Words side by side, which are one name: "[T]" and ".[F]", or "Ship" and "To".
struct NameRun {
    QString text;
    qsizetype begin = 0;
    qsizetype end = 0;

    bool Continues(const QString& token) const
    {
        const QChar first = token.front();
        if (first == u'.')
            return !text.isEmpty() && token.size() > 1 && !token[1].isDigit();
        return first == u'[' || first == u'_' || (first.isLetter() && !FindConditionWord(token));
    }
};

// --- the store --------------------------------------------------------------------------------------------------

// Mends the texts of one form or query, and counts them.
class TextMender {
public:
    explicit TextMender(const NameChange& change)
        : change_(change)
    {
    }

    int Places() const { return places_; }

    QString Statement(const QString& text, const QString& table)
    {
        return Counted(text, StatementWithNewName(text, change_, table));
    }
    QString Expression(const QString& text, ExprMode mode, bool mayBeBare)
    {
        return Counted(text, ExpressionWithNewName(text, change_, mode, mayBeBare));
    }
    QString Target(const QString& text, bool mayBeBare)
    {
        return Counted(text, ChangesTexts(change_) ? FieldWithNewName(text, change_, mayBeBare) : text);
    }
    template <typename Text>
    void Name(Text& name)
    {
        if (SameName(name.Text(), change_.from)) {
            name.Set(change_.to);
            ++places_;
        }
    }
    void Note() { ++places_; }

private:
    QString Counted(const QString& before, const QString& after)
    {
        places_ += before == after ? 0 : 1;
        return after;
    }

    const NameChange& change_;
    int places_ = 0;
};

class FormMender {
public:
    FormMender(FormDef& form, const NameChange& change)
        : form_(form)
        , change_(change)
        , mender_(change)
        , table_(form.tableName.Text())
    {
        QStringList tables = {table_};
        tables += TablesOfStatement(form.defaultQuery.Text());
        for (const ControlDef& control : form.controls) {
            if (Has(control.type, IsPressed) && control.buttonFunction == ButtonFunction::Select)
                tables += TablesOfStatement(control.source.Text());
        }
        mayBeBare_ = tables.contains(change.table, Qt::CaseInsensitive);
    }

    int Mend()
    {
        if (change_.what == NameChange::What::Table)
            mender_.Name(form_.tableName);
        if (form_.defaultQuery.IsSet())
            Put(form_.defaultQuery, mender_.Statement(form_.defaultQuery.Text(), table_));
        for (ControlDef& control : form_.controls)
            MendControl(control);
        return mender_.Places();
    }

private:
    // A text that stays keeps all its bytes.
    static void Put(VariableText& kept, const QString& text)
    {
        if (kept.Text() != text)
            kept.Set(text);
    }

    void MendControl(ControlDef& control);
    void MendDropDown(ControlDef& control);
    bool ShowsItsOwn(const ControlDef& control) const;
    void RenameControl(ControlDef& control);
    void MendButton(ControlDef& button);
    void MendAssignments(ControlDef& button);

    FormDef& form_;
    const NameChange& change_;
    TextMender mender_;
    QString table_; // as the form's statements mean it, before the change
    bool mayBeBare_ = false;
};

void FormMender::MendControl(ControlDef& control)
{
    const QString source = control.source.Text();
    switch (SourceKindOf(control.type)) {
    case SourceKind::Function:
        return MendButton(control);
    case SourceKind::Columns: {
        std::vector<SourceColumn> columns = SplitListColumns(source);
        const std::vector<SourceColumn> before = columns;
        for (SourceColumn& column : columns)
            column.expression = mender_.Expression(column.expression, ExprMode::Value, mayBeBare_);
        if (columns != before)
            control.SetSource(JoinListColumns(columns));
        return;
    }
    case SourceKind::Items:
        return MendDropDown(control);
    case SourceKind::Expression:
        if (control.hasSource != 0 && !source.isEmpty())
            return Put(control.source, mender_.Expression(source, ExprMode::Condition, mayBeBare_));
        // Other controls refer to its name, so it gets a source instead.
        if (ShowsItsOwn(control)) {
            control.hasSource = 1;
            control.SetSource(NameInBrackets(change_.to));
            mender_.Note();
        }
        return;
    case SourceKind::None:
        return;
    }
}

// Whether the control shows the field that is renamed because it bears its name.
bool FormMender::ShowsItsOwn(const ControlDef& control) const
{
    return control.fieldBound != 0 && change_.what == NameChange::What::Field && mayBeBare_ &&
           SameName(control.name.Text(), change_.from);
}

void FormMender::MendDropDown(ControlDef& control)
{
    const DropDownSource before = SplitDropDown(control.source.Text());
    DropDownSource after = before;
    after.query = mender_.Statement(before.query, {});
    const qsizetype items = DropDownItems(before.data).size();
    if (control.hasSource != 0 && items == 1)
        after.data = mender_.Expression(before.data, ExprMode::Condition, mayBeBare_);
    if (ShowsItsOwn(control) && after.data == before.data) {
        if (items == 0) {
            after.data = NameInBrackets(change_.to);
            control.hasSource = 1;
        } else {
            RenameControl(control); // its items leave no room for a source
        }
        mender_.Note();
    }
    if (after.query != before.query || after.data != before.data)
        control.SetSource(JoinDropDown(after));
}

// The control takes the field's new name, and what refers to it follows: "&Name" and "&[Name]", in quotes, too.
void FormMender::RenameControl(ControlDef& control)
{
    const QString from = QRegularExpression::escape(control.name.Text());
    const QRegularExpression reference(u"&(\\[%1\\]|%1(?![\\w]))"_s.arg(from),
                                       QRegularExpression::CaseInsensitiveOption);
    const QString to = u'&' + FieldReference(change_.to);
    for (ControlDef& each : form_.controls) {
        QString source = each.source.Text();
        qsizetype at = 0;
        for (QRegularExpressionMatch match = reference.match(source); match.hasMatch();
             match = reference.match(source, at)) {
            source.replace(match.capturedStart(), match.capturedLength(), to);
            at = match.capturedStart() + to.size();
        }
        if (source != each.source.Text())
            each.SetSource(source);
    }
    control.name.Set(change_.to);
}

void FormMender::MendButton(ControlDef& button)
{
    switch (button.buttonFunction) {
    case ButtonFunction::Select:
        return Put(button.source, mender_.Statement(button.source.Text(), table_));
    case ButtonFunction::Update:
    case ButtonFunction::UpdateAll:
    case ButtonFunction::Insert:
        return MendAssignments(button);
    case ButtonFunction::CallForm:
        if (change_.what == NameChange::What::Form && button.source.Text() == change_.from) {
            button.SetSource(change_.to);
            mender_.Note();
        }
        return;
    default: // the others have no source
        return;
    }
}

void FormMender::MendAssignments(ControlDef& button)
{
    std::vector<SourceAssignment> assignments = SplitAssignments(button.source.Text());
    const std::vector<SourceAssignment> before = assignments;
    for (SourceAssignment& each : assignments) {
        each.target = mender_.Target(each.target, mayBeBare_);
        each.value = mender_.Expression(each.value, ExprMode::Condition, mayBeBare_);
    }
    if (assignments != before)
        button.SetSource(JoinAssignments(assignments));
}

int MendQuery(QueryDef& query, const NameChange& change)
{
    TextMender mender(change);
    const QString text = query.text.Text();
    const QString mended = mender.Statement(text, query.tableName.Text());
    if (mended != text)
        query.SetText(mended);
    if (change.what == NameChange::What::Table)
        mender.Name(query.tableName);
    return mender.Places();
}

} // namespace

QString StatementWithNewName(const QString& statement, const NameChange& change, const QString& table)
{
    if (!ChangesTexts(change))
        return statement;
    if (!dialect::BeginsAsStatement(statement)) { // the bare name of a table
        const bool isIt =
            change.what == NameChange::What::Table && SameName(FieldWord::Bare(statement.trimmed()), change.from);
        return isIt ? FieldWord::Like(statement.trimmed(), change.to) : statement;
    }
    StatementWords words(statement);
    if (words.Sources().empty() && !table.isEmpty())
        words.Sources().push_back({table, {}});
    const StatementMatcher matcher(words, change);
    QString mended;
    qsizetype from = 0;
    for (const Word& word : words.Words()) {
        if (word.role == Role::Other || !matcher.Matches(word))
            continue;
        const bool bracketed = word.token.kind == TokenKind::BracketedName;
        mended += QStringView(statement).sliced(from, word.token.begin - from);
        mended += bracketed ? NameInBrackets(change.to) : FieldReference(change.to);
        from = word.token.end;
    }
    return mended + statement.sliced(from);
}

QString ExpressionWithNewName(const QString& expression, const NameChange& change, ExprMode mode, bool mayBeBare)
{
    if (!ChangesTexts(change))
        return expression;
    QString mended;
    qsizetype copied = 0; // so much of the expression is in it
    qsizetype position = 0;
    NameRun run;
    const auto finish = [&] {
        const QString now = run.text.isEmpty() ? run.text : FieldWithNewName(run.text, change, mayBeBare);
        if (now != run.text) {
            mended += expression.sliced(copied, run.begin - copied) + now;
            copied = run.end;
        }
        run = {};
    };
    while (const std::optional<ExprToken> token = NextExpressionToken(expression, position, mode)) {
        const bool isCall = position < expression.size() && expression[position] == u'(';
        // Commas part arguments, and are blanks elsewhere.
        const bool parted = QStringView(expression).sliced(run.end, token->position - run.end).contains(u',');
        if (isCall || parted || !run.Continues(token->text))
            finish();
        if (isCall || !run.Continues(token->text))
            continue;
        run.begin = run.text.isEmpty() ? token->position : run.begin;
        run.text += token->text;
        run.end = position;
    }
    finish();
    return mended + expression.sliced(copied);
}

QStringList TablesOfStatement(const QString& statement)
{
    if (!dialect::BeginsAsStatement(statement))
        return {FieldWord::Bare(statement.trimmed())};
    StatementWords words(statement);
    QStringList tables;
    for (const Source& source : words.Sources())
        tables += source.table;
    return tables;
}

std::vector<NameUse> MendNames(FormStore& store, const NameChange& change)
{
    std::vector<NameUse> uses;
    for (FormDef& form : store.Forms()) {
        if (const int places = FormMender(form, change).Mend(); places > 0)
            uses.push_back({NameUse::Holder::Form, form.name.Text(), places});
    }
    for (QueryDef& query : store.Queries()) {
        if (const int places = MendQuery(query, change); places > 0)
            uses.push_back({NameUse::Holder::Query, query.name.Text(), places});
    }
    return uses;
}

} // namespace mirel
