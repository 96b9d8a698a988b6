#pragma once

#include "platform/record_id.h"
#include "provider/provider.h"

#include <QByteArray>
#include <QString>

#include <span>
#include <vector>

namespace mirel {

// What was typed into one cell of a record, or into one control of a form.
struct TypedText {
    int place = -1; // of the field in the result, or of the control in its form, from 0
    QString name;   // of that field or control
    QString text;   // "1" or "0" for a tick
    bool isTick = false;

    friend bool operator==(const TypedText&, const TypedText&) = default;
};

// What was typed into one record and is not written yet.
struct RecordDraft {
    QString statement;      // what shows the record, without conditions that were put onto it; empty: nothing did
    RecordId record;        // null: there was none
    QByteArray fingerprint; // of the record as it was shown; empty without one
    std::vector<TypedText> texts;

    friend bool operator==(const RecordDraft&, const RecordDraft&) = default;
};

// Two records have the same one when their fields bear the same names and hold the same values.
QByteArray FingerprintOf(std::span<const ResultField> fields, std::span<const Value> values);

} // namespace mirel
