#include "expr/expr_parser.h"

#include "support/printing.h"

#include <gtest/gtest.h>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr ExprMode kValue = ExprMode::Value;
constexpr ExprMode kCondition = ExprMode::Condition;

QString Tokens(QStringView text, ExprMode mode)
{
    QString joined;
    qsizetype position = 0;
    while (const std::optional<ExprToken> token = NextExpressionToken(text, position, mode))
        joined += u'|' + token->text;
    return joined;
}

// The dump with what it does not show: "!" before a negated node, "()" around a parenthesised one.
QString Shape(const ExprNode* node)
{
    if (!node)
        return u"."_s;
    QString arguments;
    qsizetype used = 0;
    for (size_t i = 0; i < node->args.size(); ++i) {
        if (node->args[i])
            used = qsizetype(i) + 1;
    }
    for (qsizetype i = 0; i < used; ++i)
        arguments += u' ' + Shape(node->args[size_t(i)].get());
    const QString inside = used > 0 ? u'{' + node->text + arguments + u'}' : node->text;
    return (node->negated ? u"!"_s : QString()) + (node->parenthesised ? u'(' + inside + u')' : inside);
}

QString ShapeOf(QStringView text, ExprMode mode)
{
    return Shape(ParseExpression(text, mode).get());
}

struct Case {
    QString text;
    QString expected;
};

void ExpectTokens(ExprMode mode, const std::vector<Case>& rows)
{
    for (const Case& row : rows)
        EXPECT_EQ(Tokens(row.text, mode), row.expected) << row.text.toStdString();
}

void ExpectShapes(ExprMode mode, const std::vector<Case>& rows)
{
    for (const Case& row : rows)
        EXPECT_EQ(ShapeOf(row.text, mode), row.expected) << row.text.toStdString();
}

TEST(NextExpressionToken, CutsAtOperatorsAndBlanks)
{
    ExpectTokens(kValue, {{u"\t a+b , c"_s, u"|a|+|b|c"_s},
                          {u"a,b"_s, u"|a|b"_s},
                          {u"2^3%(4)"_s, u"|2|^|3|%|(|4|)"_s},
                          {u"#a$b.c&d'e"_s, u"|#a$b.c&d'e"_s},
                          {u"  ,\t"_s, QString()}});
}

TEST(NextExpressionToken, KeepsQuotesAndBracketsTogether)
{
    ExpectTokens(kValue, {{u"'it''s'"_s, u"|'it'|'s'"_s},
                          {u"'say \"(\"'\"a'b\""_s, u"|'say \"(\"'|\"a'b\""_s},
                          {u"'abc"_s, u"|'abc"_s},
                          {u"[a + b]*&[c d]"_s, u"|[a + b]|*|&[c d]"_s},
                          {u"abc[d e]f"_s, u"|abc[d e]|f"_s},
                          {u"[a]]b] + T.[[c]]]d"_s, u"|[a]]b]|+|T.[[c]]]|d"_s}, // "]]" is a "]" of the name
                          {u"[a]] + 1"_s, u"|[a]|]|+|1"_s},                     // but not where nothing closes it
                          {u"[never closed + 1"_s, u"|[never closed + 1"_s}});
}

TEST(NextExpressionToken, ReadsComparisonsByMode)
{
    ExpectTokens(kCondition, {{u"a<b"_s, u"|a|<|b"_s},
                              {u"a< , =b"_s, u"|a|<=|b"_s},
                              {u"a!=b!<c"_s, u"|a|!=|b|!|<|c"_s},
                              {u"a><b=>c==d"_s, u"|a|><|b|=>|c|==|d"_s},
                              {u"a="_s, u"|a|="_s}});
    ExpectTokens(kValue, {{u"a=b"_s, u"|a=|b"_s}, {u"a < =b!>c"_s, u"|a|<=|b!>|c"_s}, {u"=!"_s, u"|=|!"_s}});
}

TEST(Scanners, SkipInnerParenthesesAndQuotes)
{
    const QString text = u"a(b,c)'),\"x,d),e)"_s; // the " ends what the ' began
    EXPECT_EQ(FindArgumentEnd(text, 0), text.indexOf(u",d"));
    EXPECT_EQ(FindClosingParenthesis(text, 0), text.indexOf(u"),e"));
    EXPECT_EQ(FindArgumentEnd(u"a),b", 0), 1); // the function's own ")" ends the search
    EXPECT_EQ(FindClosingParenthesis(u"(a)", 0), -1);
}

TEST(ParseExpression, DecidesWhatAnOperandIs)
{
    const struct {
        QString text;
        OpCode code;
        QString content;
        double number;
    } rows[] = {
        {u"0"_s, OpCode::Number, u"0"_s, 0},
        {u"0.5"_s, OpCode::Number, u"0.5"_s, 0.5},
        {u".5"_s, OpCode::Number, u".5"_s, 0.5},
        {u".0"_s, OpCode::Field, u".0"_s, 0},
        {u"12abc"_s, OpCode::Number, u"12abc"_s, 12},
        {u"1e2"_s, OpCode::Number, u"1e2"_s, 100},
        {u"0x10"_s, OpCode::Number, u"0x10"_s, 0},
        {u"Info"_s, OpCode::Field, u"Info"_s, 0},
        {u"nan"_s, OpCode::Field, u"nan"_s, 0},
        {u"true"_s, OpCode::Number, u"true"_s, 1},
        {u"FALSE"_s, OpCode::Number, u"FALSE"_s, 0},
        {u"[1]"_s, OpCode::Field, u"[1]"_s, 0},
        {u"[Unit Price]"_s, OpCode::Field, u"[Unit Price]"_s, 0},
        {u"& x"_s, OpCode::Control, QString(), 0},
        {u"&[ Ship To ]"_s, OpCode::Control, u"Ship To"_s, 0},
        {u"&qty"_s, OpCode::Control, u"qty"_s, 0},
        {u"'5'"_s, OpCode::Text, u"5"_s, 0},
        {u"'abc"_s, OpCode::Text, u"ab"_s, 0},
        {u"'"_s, OpCode::Text, QString(), 0},
        {u"NULL"_s, OpCode::Field, u"NULL"_s, 0}, // a word of conditions only
    };
    for (const auto& row : rows) {
        const ExprTree tree = ParseExpression(row.text, kValue);
        ASSERT_TRUE(tree) << row.text.toStdString();
        EXPECT_EQ(tree->code, row.code) << row.text.toStdString();
        EXPECT_EQ(tree->text, row.content);
        EXPECT_EQ(tree->valueNumber, row.number) << row.text.toStdString();
    }
    EXPECT_FALSE(ParseExpression(QString(), kValue));
    EXPECT_FALSE(ParseExpression(u" , ()", kValue));
    EXPECT_EQ(ParseExpression(QString(5000, u'n'), kValue)->text.size(), 5000);
}

TEST(ParseExpression, HasTwoLevelsOfPrecedence)
{
    ExpectShapes(kValue, {{u"2+3*4"_s, u"{+ 2 {* 3 4}}"_s},
                          {u"2*3+4"_s, u"{+ {* 2 3} 4}"_s},
                          {u"8/2/2"_s, u"{/ {/ 8 2} 2}"_s},
                          {u"2^3^2"_s, u"{^ {^ 2 3} 2}"_s},
                          {u"1+2*3^4-5"_s, u"{- {+ 1 {^ {* 2 3} 4}} 5}"_s},
                          {u"(2+3)*4"_s, u"{* ({+ 2 3}) 4}"_s},
                          {u"2*(3+4)"_s, u"{* 2 ({+ 3 4})}"_s},
                          {u"1+(2+3)*4"_s, u"{+ 1 {* ({+ 2 3}) 4}}"_s},
                          {u"1+2*ROUND(2.5,0)"_s, u"{+ 1 {* 2 {ROUND 2.5 0}}}"_s},
                          {u"RECNO()+'/'+RECCOUNT()"_s, u"{+ {+ RECNO /} RECCOUNT}"_s}});
}

TEST(ParseExpression, HangsALeadingMinusAsItAlwaysDid)
{
    ExpectShapes(kValue, {{u"-5"_s, u"{- 5}"_s},
                          {u"-(5)"_s, u"{- . (5)}"_s},
                          {u"-ABS(5)"_s, u"{- . {ABS . 5}}"_s},
                          {u"+5"_s, u"5"_s},
                          {u"*(5)"_s, u"(5)"_s},
                          {u"-5+3"_s, u"{+ {- 5} 3}"_s},
                          {u"-2^2"_s, u"{- 2 {^ . 2}}"_s},
                          {u"-7 % 3"_s, u"{- 7 {% . 3}}"_s},
                          {u"5--3"_s, u"{- {- 5} 3}"_s},
                          {u"5*-3"_s, u"{- {* 5} 3}"_s}});
}

TEST(ParseExpression, SplitsArguments)
{
    const QString substr = u"{SUBSTR [Name] 1 3}"_s;
    ExpectShapes(kValue,
                 {{u"substr([Name], 1, 3)"_s, substr},
                  {u"SUBSTR([Name],1,3)"_s, substr},
                  {u"SUBSTR ([Name],1,3)"_s, u"SUBSTR"_s},
                  {u"REPLACE(UPPER('a,)'),\",\",LEFT([b],2))"_s, u"{REPLACE {UPPER . a,)} , {LEFT [b] 2}}"_s},
                  {u"INSTR(a,b)"_s, u"{INSTR a b}"_s},
                  {u"LEFT(a,b,c)"_s, u"{LEFT a bc}"_s}, // the last argument takes the rest
                  {u"SUBSTR(,2)"_s, u"{SUBSTR 2}"_s},
                  {u"UPPER(LOWER(a"_s, u"{UPPER . {LOWER . a}}"_s},
                  {u"SUBSTR([a],2)+'x'"_s, u"{+ {SUBSTR [a] 2} x}"_s},
                  {u"SUBSTR([a],2)+LEFT([b],1)"_s, u"{+ {SUBSTR [a] 2} {LEFT [b] 1}}"_s},
                  {u"UPPER((a)+b)"_s, u"{UPPER . {+ (a) b}}"_s}});
}

TEST(ParseExpression, LeavesOutWhatHasNoPlace)
{
    ExpectShapes(kValue, {{u"First Name"_s, u"FirstName"_s},
                          {u"[a] [b] c+d"_s, u"{+ [a][b]c d}"_s},
                          {u"'it''s'"_s, u"it"_s},
                          {u"1 2"_s, u"1"_s},
                          {u"1+2 3"_s, u"{+ 1 2}"_s},
                          {u"1+(-5) 3"_s, u"{+ 1 ({- 5})}"_s},
                          {u"(a) b"_s, u"(a)"_s},
                          {u"1) + 2"_s, u"1"_s},
                          {u"LEFT('ab',1) 'x'"_s, u"{LEFT ab 1}"_s},
                          {u"REPLACE('a','b','c') (d)"_s, u"{REPLACE a (d) c}"_s},
                          {u"UPPER('a') LEFT('b',1)"_s, u"{UPPER . {LEFT b 1}}"_s}});
}

TEST(ParseExpression, ComparesInConditionModeOnly)
{
    ExpectShapes(kCondition, {{u"[a]<5"_s, u"{< [a] 5}"_s},
                              {u"[a] < 5"_s, u"{< [a] 5}"_s},
                              {u"[a]< =5"_s, u"{<= [a] 5}"_s},
                              {u"[a]*2 => [b]"_s, u"{=> {* [a] 2} [b]}"_s},
                              {u"[a] = [b] + 1"_s, u"{+ {= [a] [b]} 1}"_s},
                              {u"[a] = ([b] + 1)"_s, u"{= [a] ({+ [b] 1})}"_s},
                              {u"[a] = UPPER('x')"_s, u"{= [a] {UPPER . x}}"_s},
                              {u"= 5"_s, u"{= 5}"_s},
                              {u"[a] like 'x%'"_s, u"{LIKE [a] x%}"_s},
                              {u"[a] >< 5"_s, u"[a]><"_s}}); // no operator, so a name beside a name
    ExpectShapes(kValue, {{u"[a]<5"_s, u"[a]<"_s}, {u"a AND b"_s, u"aANDb"_s}});
}

TEST(ParseExpression, GroupsAndWithOrFromTheLeft)
{
    ExpectShapes(kCondition, {{u"a AND b OR c"_s, u"{OR {AND a b} c}"_s},
                              {u"a OR b AND c = 1"_s, u"{AND {OR a b} {= c 1}}"_s},
                              {u"a OR (b AND c)"_s, u"{OR a {AND b c}}"_s},
                              {u"(a OR b) AND c"_s, u"{AND ({OR a b}) c}"_s},
                              {u"a AND (b + 1) > 3"_s, u"{> {AND a {+ b 1}} 3}"_s},
                              {u"[v] WHERE a = 1 OR b"_s, u"{WHERE [v] {OR {= a 1} b}}"_s},
                              {u"(x WHERE a OR b) + 1"_s, u"{+ ({WHERE x {OR a b}}) 1}"_s}});
}

TEST(ParseExpression, MovesNotOntoTheCondition)
{
    ExpectShapes(kCondition, {{u"[Due] IS NOT NULL"_s, u"!{IS [Due] NULL}"_s},
                              {u"[a] = NOT NOT 1"_s, u"{= [a] 1}"_s},
                              {u"NOT [a] = 1"_s, u"!{= [a] 1}"_s},
                              {u"NOT NOT [a] = 1"_s, u"{= [a] 1}"_s},
                              {u"NOT LENGTH([a]) = 3"_s, u"!{= {LENGTH . [a]} 3}"_s},
                              {u"NOT (a AND b) OR c"_s, u"{OR !({AND a b}) c}"_s},
                              {u"a AND NOT (b OR c)"_s, u"{AND a !({OR b c})}"_s},
                              {u"a AND NOT b = 1 AND c"_s, u"{AND {AND a !{= b 1}} c}"_s},
                              {u"NOT (NOT a = 1)"_s, u"!({= a 1})"_s},
                              {u"NOT a"_s, u"a"_s}});
}

TEST(ParseExpression, ToleratesAnySizeAndDepth)
{
    EXPECT_EQ(ShapeOf(QString(150, u'(') + u'1', kValue), u"(1)"_s);
    EXPECT_FALSE(ParseExpression(QString(10000, u'(') + u'1', kValue));
    EXPECT_FALSE(ParseExpression(u"UPPER("_s.repeated(10000), kValue));
    EXPECT_FALSE(ParseExpression(u"a WHERE "_s.repeated(10000), kCondition));
    EXPECT_TRUE(ParseExpression(u"1+"_s.repeated(1900) + u'1', kValue));
    EXPECT_FALSE(ParseExpression(u"1+"_s.repeated(500000), kValue));
    EXPECT_EQ(ParseExpression(u'\'' + QString(1 << 20, u'x') + u'\'', kValue)->text.size(), 1 << 20);
}

TEST(DumpExpression, WritesTheTreeInOrder)
{
    QString dump = u"tree: "_s;
    DumpExpression(ParseExpression(u"SUBSTR([a], 1, 2) = 'x'", kCondition).get(), dump);
    EXPECT_EQ(dump, u"tree: { { { [a] }SUBSTR{ 1 }{ 2 } }={ x } }"_s);
    DumpExpression(nullptr, dump);
    EXPECT_TRUE(dump.endsWith(u"x } }"));
}

} // namespace
} // namespace mirel
