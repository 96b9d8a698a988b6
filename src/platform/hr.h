#pragma once

#include <QtGlobal>

namespace mirel {

// The result of a call to the data provider. The numbers belong to the domain: messages, scripts and people rely
// on them, so they never change. Ok is zero; every failure has the top bit set.
enum class Hr : quint32 {
    Ok = 0,
    Unexpected = 0x8000FFFF,
    NotImplemented = 0x80004001,
    AccessDenied = 0x80070005, // busy, read-only, no permission: the context says which
    OutOfMemory = 0x8007000E,
    BadLiteral = 0x80040E07,  // a text that does not convert to the column's type
    SyntaxError = 0x80040E14, // the context names the place
    NoSuchColumn = 0x80040E11,
    RecordChanged = 0x80040E38,      // another window or program was faster: nothing was written
    IntegrityViolation = 0x80040E2F, // a rule of the table refuses the record: the context names it
    IndexExists = 0x80040E34,
    NoSuchIndex = 0x80040E35,
    NoSuchTable = 0x80040E37,
    DuplicateColumn = 0x80040E3E,
    TableExists = 0x80040E3F,
    JoinNeedsIndex = 0x80040E40,
    BadComparison = 0x80040E41,
    TooManyColumns = 0x80040E42,
    Overflow = 0x80040E57, // too long a text, too large a number, a year outside 1 to 9999
    DiskFull = 0x80040E65,
    NotADatabase = 0x80040E73,
    CannotOpen = 0x80040E4D, // no such file, a folder: the context names path and reason
    NotOpen = 0x800A0E78,    // the call needs an open result
    NoCurrentRecord = 0x800A0BCD,
    ReadOnly = 0x800A0CB3, // the result cannot be updated
};

constexpr bool Failed(Hr hr)
{
    return (static_cast<quint32>(hr) & 0x80000000U) != 0;
}

} // namespace mirel
