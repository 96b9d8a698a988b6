#pragma once

#include <QStringView>

namespace mirel {

// The position of the first `wanted` at or after `from`, -1 when there is none. The time grows with the length of
// the text alone, whatever the two hold.
qsizetype FindText(QStringView text, QStringView wanted, qsizetype from);

// The position of the `occurrence`-th match, counted from 1, or 0. Matches do not overlap. A negative start
// searches backward from that many characters before the end.
qsizetype PositionOfMatch(QStringView text, QStringView wanted, qint64 start, qint64 occurrence);

} // namespace mirel
