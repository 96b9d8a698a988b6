#pragma once

#include "expr/evaluation.h"
#include "resources/string_id.h"

#include <span>
#include <string_view>

namespace mirel {

enum class ResultKind { Number, Text, Date };

// One function of the language. A new one is one row in function_library.cpp and one small function above it.
struct FunctionDef {
    std::u16string_view name; // in upper case; the first row that fits wins
    NodeKind kind;            // how many argument slots the parser gives it
    int code;                 // never renumber
    Evaluator evaluate;       // null: the value comes from outside; the evaluator leaves it alone

    // The arguments, one letter each: "t" text, "n" number, "i" integer, "d" text of a date, "a" anything. Those
    // after "|" are optional. A null argument makes the result null without a call of `evaluate`, except for
    // "a".
    std::string_view parameters;
    ResultKind result;
    Str help; // "UPPER(text): the text in upper case"

    int required = Count(parameters.substr(0, parameters.find('|')));
    int allowed = Count(parameters);

    char Parameter(int index) const { return parameters[size_t(index < required ? index : index + 1)]; }

private:
    static constexpr int Count(std::string_view letters)
    {
        return int(letters.size()) - (letters.find('|') == letters.npos ? 0 : 1);
    }
};

std::span<const FunctionDef> Functions();
const FunctionDef* FindFunction(QStringView name); // in any case; null: unknown

// Whether the tree asks how many records there are. Counting takes time, so it is left out where nothing asks.
bool AsksForRecordCount(const ExprNode& tree);

} // namespace mirel
