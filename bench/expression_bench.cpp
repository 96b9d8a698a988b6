// Expressions against muParser (numbers) and Lua (texts), on the same records and without the fetch: each
// evaluation takes the next of 1024 records.
#include "expr/evaluator.h"
#include "expr/expr_parser.h"

#include <benchmark/benchmark.h>
#include <lua.hpp>
#include <muParser.h>

#include <array>
#include <vector>

namespace mirel {
namespace {

constexpr size_t kRecords = 1024;
constexpr char16_t kNumber[] = u"[Price]*[Qty]*(1+0.2)";
constexpr char16_t kText[] = u"UPPER([Name])+'/'+[City]";
constexpr char16_t kCondition[] = u"[Price] >= 100 AND [Name] LIKE 'A%'";
constexpr char16_t kToParse[] = u"[Price]*[Qty] >= 100 AND UPPER([Name]) LIKE 'A%' OR [Due] = 1"; // 61 characters

struct Record {
    double price;
    int quantity;
    QByteArray name;
    QByteArray city;
};

const std::vector<Record>& Records()
{
    static const std::vector<Record> records = [] {
        const std::array names = {"Anna Smith", "Barbara Jones", "Alexander Brown", "Charles Wilson",
                                  "Amy Taylor"};
        const std::array cities = {"Hamburg", "New York", "Lisbon", "Oslo"};
        std::vector<Record> made;
        for (size_t i = 0; i < kRecords; ++i) {
            made.push_back(
                {0.25 * double(i % 997), int(i % 17), names[i * 7 % names.size()], cities[i * 5 % cities.size()]});
        }
        return made;
    }();
    return records;
}

class MemoryContext : public EvalContext {
public:
    MemoryContext()
    {
        for (const Record& record : Records()) {
            rows_.push_back({Value::Double(record.price), Value::Integer(record.quantity),
                             Value::Text(QString::fromLatin1(record.name)),
                             Value::Text(QString::fromLatin1(record.city))});
        }
    }

    void Next() { position_ = (position_ + 1) % kRecords; }

    qint64 Position() override { return qint64(position_); }
    qint64 RecordCount() override { return kRecords; }
    int FindColumn(QStringView name) override
    {
        static const std::array<QStringView, 4> kNames = {u"[Price]", u"[Qty]", u"[Name]", u"[City]"};
        const auto at = std::ranges::find(kNames, name);
        return at == kNames.end() ? -1 : int(at - kNames.begin());
    }
    FieldType TypeOfColumn(int column) override
    {
        constexpr std::array kTypes = {FieldType::Double, FieldType::Integer, FieldType::Text, FieldType::Text};
        return kTypes[size_t(column)];
    }
    const Value& FieldValue(int column) override { return rows_[position_][size_t(column)]; }
    QStringView YesNoWord(bool truth) override { return truth ? u"Yes" : u"No"; }
    QString ControlText(QStringView) override { return {}; }

private:
    std::vector<std::array<Value, 4>> rows_;
    size_t position_ = 0;
};

void Evaluate(benchmark::State& state, const char16_t* expression, ExprMode mode)
{
    MemoryContext context;
    const ExprTree tree = ParseExpression(expression, mode);
    for (auto _ : state) {
        context.Next();
        benchmark::DoNotOptimize(EvaluateExpression(context, *tree));
    }
}

void NumberHere(benchmark::State& state)
{
    Evaluate(state, kNumber, ExprMode::Value);
}
BENCHMARK(NumberHere);

void NumberMuParser(benchmark::State& state)
{
    double price = 0;
    double quantity = 0;
    mu::Parser parser;
    parser.DefineVar("Price", &price);
    parser.DefineVar("Qty", &quantity);
    parser.SetExpr("Price*Qty*(1+0.2)");
    size_t position = 0;
    for (auto _ : state) {
        position = (position + 1) % kRecords;
        price = Records()[position].price;
        quantity = Records()[position].quantity;
        benchmark::DoNotOptimize(parser.Eval());
    }
}
BENCHMARK(NumberMuParser);

void TextHere(benchmark::State& state)
{
    Evaluate(state, kText, ExprMode::Value);
}
BENCHMARK(TextHere);

// The texts are Lua's own before the clock starts; a call gets them as arguments.
void TextLua(benchmark::State& state)
{
    lua_State* lua = luaL_newstate();
    luaL_openlibs(lua);
    const auto push = [lua](const QByteArray& text) {
        lua_pushlstring(lua, text.constData(), size_t(text.size()));
    };
    lua_createtable(lua, 2 * kRecords, 0);
    for (size_t i = 0; i < kRecords; ++i) {
        push(Records()[i].name);
        lua_rawseti(lua, 1, lua_Integer(2 * i));
        push(Records()[i].city);
        lua_rawseti(lua, 1, lua_Integer(2 * i + 1));
    }
    luaL_dostring(lua, "local upper = string.upper\n"
                       "return function(name, city) return upper(name) .. '/' .. city end");
    size_t position = 0;
    for (auto _ : state) {
        position = (position + 1) % kRecords;
        lua_pushvalue(lua, 2);
        lua_rawgeti(lua, 1, lua_Integer(2 * position));
        lua_rawgeti(lua, 1, lua_Integer(2 * position + 1));
        lua_call(lua, 2, 1);
        size_t length = 0;
        benchmark::DoNotOptimize(lua_tolstring(lua, -1, &length));
        lua_settop(lua, 2);
    }
    lua_close(lua);
}
BENCHMARK(TextLua);

void ConditionHere(benchmark::State& state)
{
    Evaluate(state, kCondition, ExprMode::Condition);
}
BENCHMARK(ConditionHere);

void Parse(benchmark::State& state)
{
    for (auto _ : state)
        benchmark::DoNotOptimize(ParseExpression(kToParse, ExprMode::Condition));
}
BENCHMARK(Parse);

} // namespace
} // namespace mirel
