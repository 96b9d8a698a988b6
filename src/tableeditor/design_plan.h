#pragma once

#include "tableeditor/table_design.h"

#include <QString>
#include <QStringList>

#include <vector>

namespace mirel {

// The statements that make a table from its design: the table, then an index for each field that wants one.
QStringList StatementsOfNewTable(const TableDesign& design);

// The way from a table as it is to what it shall be.
struct DesignPlan {
    struct Conversion {
        QString field; // by its name in the table as it is
        FieldType type;
        int size;
    };
    QStringList statements; // in the order in which they are run, as one transaction
    QStringList dropped;    // the fields that go, by their names in the table as it is
    std::vector<Conversion> conversions;

    bool ChangesNothing() const { return statements.isEmpty(); }
};

// Fields are known by `was`: those that no wanted field was, go; names may be exchanged. A changed type or size is
// a new field that takes the old one's values and its place. `wanted` must be faultless and of the same table;
// indexes on several fields stay for as long as all of their fields do.
DesignPlan PlanDesign(const TableDesign& current, const std::vector<FieldDesign>& wanted);

} // namespace mirel
