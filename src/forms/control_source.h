#pragma once

#include <QString>
#include <QStringList>
#include <QStringView>

#include <vector>

namespace mirel {

// What the ControlSource of a button, a list or a drop-down box holds besides one plain text, taken apart and put
// together. Readers take any text: what does not belong to the run is left out.

// A button's "set this field to that": UPDATE, UPDATE ALL and insert carry a run of them.
struct SourceAssignment {
    QString target; // table and field as a statement writes them
    QString value;  // an expression; empty: the assignment does nothing

    friend bool operator==(const SourceAssignment&, const SourceAssignment&) = default;
};
std::vector<SourceAssignment> SplitAssignments(QStringView source);
QString JoinAssignments(const std::vector<SourceAssignment>& assignments);

struct SourceColumn {
    QString name;
    QString expression;

    friend bool operator==(const SourceColumn&, const SourceColumn&) = default;
};
std::vector<SourceColumn> SplitListColumns(QStringView source);
QString JoinListColumns(const std::vector<SourceColumn>& columns);

struct DropDownSource {
    QString query; // empty: the items are in `data` alone
    QString data;

    friend bool operator==(const DropDownSource&, const DropDownSource&) = default;
};
DropDownSource SplitDropDown(QStringView source);
QString JoinDropDown(const DropDownSource& source);
// The items that line ends or ";" part; blanks around them and empty ones do not count.
QStringList DropDownItems(QStringView data);

// A field as a target names it: "T.F", "[My Table].[My Field]", or the field alone.
struct TargetName {
    QString table; // without brackets; empty: none given
    QString field;

    friend bool operator==(const TargetName&, const TargetName&) = default;
};
TargetName SplitTarget(QStringView target);

} // namespace mirel
