#pragma once

#include "platform/field_type.h"

#include <QStringView>

#include <span>

namespace mirel::dialect {

enum class Function : quint8 {
    Count,
    Sum,
    Average,
    Minimum,
    Maximum,
    Upper,
    Lower,
    Length,
    Substring,
    Left,
    Right,
    Trim,
    TrimLeft,
    TrimRight,
    Replace,
    Find,
    Round,
    Absolute,
    Whole,
    Coalesce,
    Choose,
    Year,
    Month,
    Day,
    Hour,
    Minute,
    Second,
    Now,
    Today,
};

// What a function makes of its arguments' types, and what it asks of them.
enum class ArgumentKind : quint8 { Any, Text, Number, Date, Condition };
enum class ResultKind : quint8 {
    OfFirst,  // the type of the first argument
    OfLast,   // the type of the last one
    LongText, // Memo
    Whole,    // Integer
    Real,     // Double
    Moment,   // Date
    Total,    // Integer for integers, else Double
};

struct FunctionDef {
    QStringView name; // upper case
    Function function;
    bool isAggregate;
    int minArguments;
    int maxArguments;
    ArgumentKind first; // what the first argument is read as
    ArgumentKind rest;  // and the others
    ResultKind result;
};

// Every function of the dialect by its names: the parser, the help and the completion read this table.
std::span<const FunctionDef> Functions();

const FunctionDef* FindFunction(QStringView name); // in any case; null: none

} // namespace mirel::dialect
