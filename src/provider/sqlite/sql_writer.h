#pragma once

#include "provider/dialect/expression_checker.h"

#include <QByteArray>

#include <span>
#include <vector>

namespace mirel::sqlite {

// A name as SQL: in brackets, or in doubled quotation marks where the name itself holds a "]".
QByteArray QuoteName(QStringView name);
// A text as an SQL literal, whatever it holds.
QByteArray QuoteText(QStringView text);

// Writes checked expressions as SQL: as few parentheses as it takes, and chains of AND and OR balanced, because
// SQLite's parser and its expressions have a depth. Names of columns are qualified with the source's alias,
// "t0" for the first.
class SqlWriter {
public:
    // The sources must outlive the writer.
    explicit SqlWriter(const std::vector<dialect::Source>& sources)
        : sources_(sources)
    {
    }

    QByteArray Write(const dialect::Expr& expression);
    // Whether all that was written is no deeper and no longer than SQLite is asked to read.
    enum class Fit : quint8 { Fits, TooDeep, TooLong };
    Fit HowItFits() const { return fit_; }
    qsizetype TooDeepAt() const { return tooDeepAt_; } // in the statement, from 0

    static QByteArray Alias(size_t source) { return "t" + QByteArray::number(qulonglong(source)); }

private:
    class Deeper;

    void Node(const dialect::Expr& expression);
    void Operand(const dialect::Expr& expression, dialect::Binding least, int waiting);
    void Column(const dialect::Expr& column);
    void Binary(const dialect::Expr& expression);
    void Infix(const dialect::Expr& expression, const char* sign, dialect::Binding left, dialect::Binding right);
    void Postfix(const dialect::Expr& expression, const char* words);
    void Chain(std::span<const dialect::Expr* const> parts, dialect::Operation operation);
    void Like(const dialect::Expr& expression);
    void In(const dialect::Expr& expression);
    void Between(const dialect::Expr& expression);
    static void CollectTerms(const dialect::Expr& expression, dialect::Operation operation,
                             std::vector<const dialect::Expr*>& terms);
    void Concatenated(const dialect::Expr& expression);
    void Joined(const dialect::Expr& expression);
    void Shown(const dialect::Expr& operand, int waiting);
    void Sum(const dialect::Expr& expression);
    void Negated(const dialect::Expr& expression);
    void Choice(const dialect::Expr& expression);
    void Call(const dialect::Expr& expression);
    void Fill(const char* pattern, const dialect::Expr& expression);
    void List(std::list<dialect::Expr>::const_iterator first, std::list<dialect::Expr>::const_iterator last);

    const std::vector<dialect::Source>& sources_;
    QByteArray sql_;
    int waiting_ = 0;       // symbols that SQLite's parser has put aside at this point
    qsizetype written_ = 0; // bytes, by earlier calls of Write
    qsizetype tooDeepAt_ = 0;
    Fit fit_ = Fit::Fits;
};

} // namespace mirel::sqlite
