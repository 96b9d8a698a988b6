#pragma once

#include <QStringView>

namespace mirel {

// The position of the first `wanted` at or after `from`, or -1. The time depends only on the length of the text,
// not on what the two contain.
qsizetype FindText(QStringView text, QStringView wanted, qsizetype from);

// The position of the `occurrence`-th match, counted from 1, or 0. Matches do not overlap. A negative start
// searches backward from that many characters before the end.
qsizetype PositionOfMatch(QStringView text, QStringView wanted, qint64 start, qint64 occurrence);

} // namespace mirel
