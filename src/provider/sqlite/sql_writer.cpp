#include "provider/sqlite/sql_writer.h"

#include "provider/sqlite/plan.h"

#include <algorithm>
#include <array>

namespace mirel::sqlite {

using namespace dialect;

namespace {

// SQLite's parser keeps 100 symbols aside; a statement around the expression takes some of them.
constexpr int kMaxWaiting = 80;
// Of all that one writer writes: a memo of 16 million characters goes in whole, whatever they are.
constexpr qsizetype kMaxLength = 160 << 20;

struct FunctionSql {
    Function function;
    const char* pattern; // %1 and %2 are arguments, %* is all of them
};

// How each function is written. Own and foreign dates alike arrive in the stored form.
constexpr std::array kFunctions = {
    FunctionSql{Function::Count, "count(%*)"},
    FunctionSql{Function::Sum, "sum(%*)"},
    FunctionSql{Function::Average, "avg(%*)"},
    FunctionSql{Function::Minimum, "min(%*)"},
    FunctionSql{Function::Maximum, "max(%*)"},
    FunctionSql{Function::Upper, "mirel_upper(%1)"},
    FunctionSql{Function::Lower, "mirel_lower(%1)"},
    FunctionSql{Function::Length, "length(%1)"},
    FunctionSql{Function::Substring, "substr(%*)"},
    FunctionSql{Function::Left, "substr(%1,1,max(%2,0))"},
    FunctionSql{Function::Right, "substr(%1,-max(%2,0),max(%2,0))"},
    FunctionSql{Function::Trim, "trim(%1)"},
    FunctionSql{Function::TrimLeft, "ltrim(%1)"},
    FunctionSql{Function::TrimRight, "rtrim(%1)"},
    FunctionSql{Function::Replace, "replace(%*)"},
    FunctionSql{Function::Find, "instr(%*)"},
    FunctionSql{Function::Round, "round(%*)"},
    FunctionSql{Function::Absolute, "abs(%1)"},
    FunctionSql{Function::Whole, "CAST(floor(%1) AS INTEGER)"},
    FunctionSql{Function::Coalesce, "coalesce(%*)"},
    FunctionSql{Function::Choose, ""}, // see Choice
    FunctionSql{Function::Year, "CAST(strftime('%Y',%1) AS INTEGER)"},
    FunctionSql{Function::Month, "CAST(strftime('%m',%1) AS INTEGER)"},
    FunctionSql{Function::Day, "CAST(strftime('%d',%1) AS INTEGER)"},
    FunctionSql{Function::Hour, "CAST(strftime('%H',%1) AS INTEGER)"},
    FunctionSql{Function::Minute, "CAST(strftime('%M',%1) AS INTEGER)"},
    FunctionSql{Function::Second, "CAST(strftime('%S',%1) AS INTEGER)"},
    FunctionSql{Function::Now, "mirel_date(datetime('now','localtime'))"},
    FunctionSql{Function::Today, "date('now','localtime')"},
};

constexpr bool InOrder()
{
    for (size_t i = 0; i < kFunctions.size(); ++i) {
        if (size_t(kFunctions[i].function) != i)
            return false;
    }
    return kFunctions.size() == size_t(Function::Today) + 1;
}
static_assert(InOrder(), "one row a function, in the order of the enum");

// NOT LIKE is a NOT before a call here.
Binding SqlBinding(const Expr& expression)
{
    if (expression.operation == Operation::Like)
        return Binding::Operand;
    if (expression.operation == Operation::NotLike)
        return Binding::Not;
    if (expression.operation == Operation::Number && expression.text.startsWith(u'-'))
        return Binding::Sign;
    return BindingOf(expression.operation);
}

Binding Above(Binding binding)
{
    return Binding(int(binding) + 1);
}

} // namespace

QByteArray QuoteName(QStringView name)
{
    QByteArray utf8 = name.toUtf8();
    if (!utf8.contains(']'))
        return '[' + utf8 + ']';
    return '"' + utf8.replace('"', "\"\"") + '"';
}

QByteArray QuoteText(QStringView text)
{
    QByteArray utf8 = text.toUtf8();
    if (utf8.contains('\0')) // would end the statement
        return "CAST(x'" + utf8.toHex() + "' AS TEXT)";
    return '\'' + utf8.replace('\'', "''") + '\'';
}

// Counts what waits on SQLite's parser stack while an operand is written.
class SqlWriter::Deeper {
public:
    Deeper(SqlWriter& writer, int waiting, qsizetype at)
        : writer_(writer)
        , waiting_(waiting)
    {
        writer_.waiting_ += waiting_;
        if (writer_.waiting_ > kMaxWaiting && writer_.fit_ == Fit::Fits) {
            writer_.fit_ = Fit::TooDeep;
            writer_.tooDeepAt_ = at;
        } else if (writer_.written_ + writer_.sql_.size() > kMaxLength) {
            writer_.fit_ = Fit::TooLong;
        }
    }
    ~Deeper() { writer_.waiting_ -= waiting_; }
    Q_DISABLE_COPY_MOVE(Deeper)

private:
    SqlWriter& writer_;
    int waiting_;
};

QByteArray SqlWriter::Write(const Expr& expression)
{
    sql_.clear();
    waiting_ = 0;
    Node(expression);
    written_ += sql_.size();
    return std::exchange(sql_, {});
}

void SqlWriter::Operand(const Expr& expression, Binding least, int waiting)
{
    const bool bare = SqlBinding(expression) >= least;
    const Deeper deeper(*this, waiting + (bare ? 0 : 1), expression.place.begin);
    if (fit_ != Fit::Fits)
        return;
    if (!bare)
        sql_ += '(';
    Node(expression);
    if (!bare)
        sql_ += ')';
}

void SqlWriter::Node(const Expr& expression)
{
    switch (expression.operation) {
    case Operation::Null:
        sql_ += "NULL";
        return;
    case Operation::True:
        sql_ += '1';
        return;
    case Operation::False:
        sql_ += '0';
        return;
    case Operation::Number:
        sql_ += expression.text.toLatin1();
        return;
    case Operation::Text:
    case Operation::Date:
        sql_ += QuoteText(expression.text);
        return;
    case Operation::Column:
        return Column(expression);
    case Operation::AllColumns:
        sql_ += '*';
        return;
    case Operation::Call:
        return Call(expression);
    default:
        return Binary(expression);
    }
}

// Everything that has a sign or words of its own.
void SqlWriter::Binary(const Expr& expression)
{
    const auto compare = [&](const char* sign) { Infix(expression, sign, Binding::Text, Binding::Text); };
    switch (expression.operation) {
    case Operation::Or:
    case Operation::And: {
        std::vector<const Expr*> parts;
        for (const Expr& part : expression.arguments)
            parts.push_back(&part);
        return Chain(parts, expression.operation);
    }
    case Operation::Not:
        sql_ += "NOT ";
        return Operand(expression.arguments.front(), Binding::Not, 1);
    case Operation::Equal:
        return compare("=");
    case Operation::NotEqual:
        return compare("<>");
    case Operation::Less:
        return compare("<");
    case Operation::LessEqual:
        return compare("<=");
    case Operation::Greater:
        return compare(">");
    case Operation::GreaterEqual:
        return compare(">=");
    case Operation::Like:
    case Operation::NotLike:
        return Like(expression);
    case Operation::In:
    case Operation::NotIn:
        return In(expression);
    case Operation::Between:
    case Operation::NotBetween:
        return Between(expression);
    case Operation::IsNull:
        return Postfix(expression, " IS NULL");
    case Operation::IsNotNull:
        return Postfix(expression, " IS NOT NULL");
    case Operation::IsTrue:
        return Postfix(expression, " IS TRUE");
    case Operation::IsNotTrue:
        return Postfix(expression, " IS NOT TRUE");
    case Operation::IsFalse:
        return Postfix(expression, " IS FALSE");
    case Operation::IsNotFalse:
        return Postfix(expression, " IS NOT FALSE");
    case Operation::Join:
        return Joined(expression);
    case Operation::Concat: // binds tighter here than in the dialect
        return Concatenated(expression);
    case Operation::Add:
    case Operation::Subtract:
        return Sum(expression);
    case Operation::Multiply:
        return Infix(expression, "*", Binding::Product, Binding::Sign);
    case Operation::Divide: // 7/2 is 3.5 whatever the columns' types
        return Infix(expression, "* 1.0 /", Binding::Product, Binding::Sign);
    case Operation::Remainder:
        return Infix(expression, "%", Binding::Product, Binding::Sign);
    case Operation::Negate:
        return Negated(expression);
    default:
        return;
    }
}

void SqlWriter::Column(const Expr& column)
{
    const Source& source = sources_[size_t(column.source)];
    const dialect::Column& definition = source.table->columns[size_t(column.column)];
    const QByteArray name = Alias(size_t(column.source)) + '.' + QuoteName(definition.name);
    sql_ += definition.foreignDates ? kDateFunction + ('(' + name + ')') : name;
}

void SqlWriter::Infix(const Expr& expression, const char* sign, Binding left, Binding right)
{
    Operand(expression.arguments.front(), left, 0);
    sql_ += ' ';
    sql_ += sign;
    sql_ += ' ';
    Operand(expression.arguments.back(), right, 2);
}

void SqlWriter::Postfix(const Expr& expression, const char* words)
{
    Operand(expression.arguments.front(), Binding::Text, 0);
    sql_ += words;
}

// Halves the chain: AND is left-associative, so only right halves stand in parentheses.
void SqlWriter::Chain(std::span<const Expr* const> parts, Operation operation)
{
    const Binding least = Above(BindingOf(operation));
    if (parts.size() == 1)
        return Operand(*parts.front(), least, 0);
    const size_t half = (parts.size() + 1) / 2;
    Chain(parts.first(half), operation);
    sql_ += operation == Operation::And ? " AND " : " OR ";
    const auto rest = parts.subspan(half);
    if (rest.size() == 1)
        return Operand(*rest.front(), least, 2);
    const Deeper deeper(*this, 3, rest.front()->place.begin);
    sql_ += '(';
    Chain(rest, operation);
    sql_ += ')';
}

void SqlWriter::Like(const Expr& expression)
{
    sql_ += expression.operation == Operation::NotLike ? "NOT " : "";
    const Deeper deeper(*this, expression.operation == Operation::NotLike ? 1 : 0, expression.place.begin);
    sql_ += kLikeFunction;
    sql_ += '(';
    List(expression.arguments.begin(), expression.arguments.end());
    sql_ += ')';
}

void SqlWriter::In(const Expr& expression)
{
    Operand(expression.arguments.front(), Binding::Text, 0);
    sql_ += expression.operation == Operation::In ? " IN (" : " NOT IN (";
    List(std::next(expression.arguments.begin()), expression.arguments.end());
    sql_ += ')';
}

void SqlWriter::Between(const Expr& expression)
{
    auto argument = expression.arguments.begin();
    Operand(*argument, Binding::Text, 0);
    sql_ += expression.operation == Operation::Between ? " BETWEEN " : " NOT BETWEEN ";
    Operand(*++argument, Binding::Text, 2);
    sql_ += " AND ";
    Operand(*++argument, Binding::Text, 4);
}

// A chain of one operation in the order of its operands, however it is bracketed: joining texts is associative.
void SqlWriter::CollectTerms(const Expr& expression, Operation operation, std::vector<const Expr*>& terms)
{
    for (const Expr& argument : expression.arguments) {
        if (argument.operation == operation)
            CollectTerms(argument, operation, terms);
        else
            terms.push_back(&argument);
    }
}

void SqlWriter::Concatenated(const Expr& expression)
{
    std::vector<const Expr*> terms;
    CollectTerms(expression, Operation::Concat, terms);
    for (const Expr* term : terms) {
        sql_ += term == terms.front() ? "" : " || ";
        Shown(*term, term == terms.front() ? 0 : 2);
    }
}

void SqlWriter::Joined(const Expr& expression)
{
    std::vector<const Expr*> terms;
    CollectTerms(expression, Operation::Join, terms);
    for (const Expr* term : terms) {
        sql_ += term == terms.front() ? "coalesce(" : "||coalesce(";
        Shown(*term, term == terms.front() ? 3 : 5);
        sql_ += ",'')";
    }
}

// An operand of a joined text.
void SqlWriter::Shown(const Expr& operand, int waiting)
{
    if (operand.type != FieldType::Double && operand.type != FieldType::Date)
        return Operand(operand, Binding::Operand, waiting);
    sql_ += kTextFunction;
    sql_ += '(';
    Operand(operand, Binding::None, waiting + 3);
    sql_ += ',' + QByteArray::number(int(operand.type)) + ')';
}

// Dates are texts in the file: they move by days, and lie days apart, as Julian day numbers.
void SqlWriter::Sum(const Expr& expression)
{
    const Expr& left = expression.arguments.front();
    const Expr& right = expression.arguments.back();
    const char* sign = expression.operation == Operation::Add ? "+" : "-";
    if (left.type != FieldType::Date && right.type != FieldType::Date)
        return Infix(expression, sign, Binding::Sum, Binding::Product);
    const auto term = [this](const Expr& operand, int waiting) {
        const bool isDate = operand.type == FieldType::Date;
        sql_ += isDate ? "julianday(" : "";
        Operand(operand, isDate ? Binding::None : Binding::Product, waiting + 3);
        sql_ += isDate ? ")" : "";
    };
    const bool isDate = expression.type == FieldType::Date;
    sql_ += isDate ? kDateFunction : "";
    sql_ += '(';
    term(left, 3);
    sql_ += sign;
    term(right, 5);
    sql_ += ')';
}

void SqlWriter::Negated(const Expr& expression)
{
    const Expr& operand = expression.arguments.front();
    sql_ += '-';
    Operand(operand, Binding::Operand, 1); // two signs in a row would begin a comment
}

// A choice in the place of the last argument is one more WHEN of the same CASE, so that a long ladder of them is
// not deep.
void SqlWriter::Choice(const Expr& expression)
{
    const auto isChoice = [](const Expr& candidate) {
        return candidate.operation == Operation::Call && candidate.function == Function::Choose;
    };
    sql_ += "CASE";
    const Expr* choice = &expression;
    for (; isChoice(*choice); choice = &choice->arguments.back()) {
        sql_ += " WHEN ";
        Operand(choice->arguments.front(), Binding::None, 4);
        sql_ += " THEN ";
        Operand(*std::next(choice->arguments.begin()), Binding::None, 6);
    }
    sql_ += " ELSE ";
    Operand(*choice, Binding::None, 4);
    sql_ += " END";
}

void SqlWriter::Call(const Expr& expression)
{
    if (expression.function == Function::Choose)
        return Choice(expression);
    if (expression.distinct) {
        const QByteArray pattern = kFunctions[size_t(expression.function)].pattern;
        return Fill(QByteArray(pattern).replace('(', "(DISTINCT ").constData(), expression);
    }
    Fill(kFunctions[size_t(expression.function)].pattern, expression);
}

void SqlWriter::Fill(const char* pattern, const Expr& expression)
{
    int nesting = 0;
    for (const char* at = pattern; *at; ++at) {
        nesting += *at == '(' ? 1 : *at == ')' ? -1 : 0;
        const char next = *at == '%' ? at[1] : '\0';
        const Deeper deeper(*this, 4 * (nesting - 1), expression.place.begin);
        if (next == '*') {
            List(expression.arguments.begin(), expression.arguments.end());
        } else if (next == '1' || next == '2') {
            Operand(*std::next(expression.arguments.begin(), next - '1'), Binding::None, at[-1] == '(' ? 3 : 5);
        } else {
            sql_ += *at;
            continue;
        }
        ++at;
    }
}

void SqlWriter::List(std::list<Expr>::const_iterator first, std::list<Expr>::const_iterator last)
{
    for (auto argument = first; argument != last; ++argument) {
        if (argument != first)
            sql_ += ',';
        Operand(*argument, Binding::None, argument == first ? 3 : 5);
    }
}

} // namespace mirel::sqlite
