#pragma once

#include "forms/form_records.h"

#include <QRect>
#include <QString>
#include <QStringList>

namespace mirel {

// The window identifier of a running form's first control; the others follow in list order.
inline constexpr int kFirstControlWindow = 40000;

// One control of a running form as a window shows it. Definition and place stay what they are while the form
// runs; the rest changes, and with each change `revision` grows.
struct ControlRun {
    const ControlDef* definition = nullptr; // the running form's own
    int windowId = 0;
    ControlType type = ControlType::None;
    QString name; // a label's and a button's caption

    QString text;        // of edit boxes and drop-down boxes; the caption of labels and buttons
    bool ticked = false; // of check boxes
    QStringList items;   // what a drop-down box offers; other texts may be typed
    QStringList columns; // the headers of a list
    qint64 rows = 0;     // of a list: a row for each record of the form's result
    qint64 selectedRow = -1;
    int sortedColumn = -1; // of a list, with the direction below; -1: none
    bool sortedDescending = false;

    bool edited = false;     // the user changed it, and that is not saved yet
    bool keepsInput = false; // shows a field or goes into an UPDATE: a change makes the record dirty
    bool isClock = false;
    quint64 revision = 0;
};

// Where the windows of a control stand, in form coordinates. `second` is null but for date pickers, whose picker
// lies beneath the box over the full width, and extendable boxes, whose button opens the longer text.
struct ControlParts {
    QRect main;
    QRect second;
};
ControlParts PartsOf(const ControlDef& control);

} // namespace mirel
