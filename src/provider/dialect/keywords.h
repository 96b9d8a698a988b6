#pragma once

#include <QStringView>

namespace mirel::dialect {

// The dialect's reserved words. They count in any case; a name that is one of them stands in brackets. The
// words of structure changes (ADD, MOVE, RENAME, …) are not among them: they mean something in one place only.
enum class Keyword : quint8 {
    None,
    Alter,
    And,
    As,
    Asc,
    Between,
    By,
    Create,
    Delete,
    Desc,
    Distinct,
    Drop,
    False,
    From,
    Group,
    Having,
    In,
    Inner,
    Insert,
    Into,
    Is,
    Join,
    Left,
    Like,
    Not,
    Null,
    On,
    Or,
    Order,
    Right,
    Select,
    Set,
    True,
    Union,
    Update,
    Values,
    Where,
};

Keyword FindKeyword(QStringView word); // None: not reserved

inline bool IsReservedWord(QStringView word)
{
    return FindKeyword(word) != Keyword::None;
}

} // namespace mirel::dialect
