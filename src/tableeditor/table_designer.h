#pragma once

#include "forms/name_change.h"
#include "tableeditor/design_run.h"

namespace mirel {

// What stands around a designer: the views on the table's records, and all that refers to its names. Does nothing
// by itself: for a program without views.
class DesignHost {
public:
    virtual ~DesignHost() = default;

    // Before a table changes, the views on it write what is pending. False when one cannot, which the user was
    // told.
    virtual bool WritePending(const QString& table)
    {
        (void)table;
        return true;
    }
    // Afterwards they run again, or close.
    virtual void TableChanged(const QString& table) { (void)table; }
    virtual void TableDropped(const QString& table) { (void)table; }
    // Does `rename` and mends what refers to the name, where the user wants that; what it gives to `rename` is
    // done last in the transaction.
    virtual bool Rename(const NameChange& change,
                        const std::function<bool(const DesignRun::LastStep& last)>& rename)
    {
        (void)change;
        return rename({});
    }
};

// The table designer without its window: a new table is built as a list and made at once by Create; an existing
// one changes with every call. Rows count from 0, in table order; one is selected, unless there is none.
//
// A call that fails returns false, has told why, and leaves list and table as they were; only where another
// program has changed the table meanwhile, the list shows it as it is then. All arguments must outlive the
// designer.
class TableDesigner {
public:
    TableDesigner(DbConnection& connection, DatabaseLocation database, UserPrompt& prompt, DesignHost& host);

    // Turns to an existing table.
    bool Open(const QString& table);
    bool IsNew() const { return isNew_; }
    const QString& Table() const { return design_.table; }
    const std::vector<FieldDesign>& Fields() const { return design_.fields; }
    int SelectedRow() const { return selected_; } // -1: none
    void Select(int row);

    // A new table's, no statement is run.
    void SetTableName(const QString& name) { design_.table = name.trimmed(); }
    // Asks, makes table and indexes, tells; from then on the table is an existing one.
    bool Create();

    bool RenameTable(const QString& newName);
    bool DropTable(); // asks

    // Behind the last one, and selected.
    bool AddField(FieldDesign field);
    // Name, type and size, index: on an existing table each that differs is a change of its own, in this order.
    // What was done before one that fails stays.
    bool ChangeField(int row, FieldDesign field);
    bool DropField(int row); // asks, where the table exists
    bool MoveUp(int row) { return Exchange(row - 1, row - 1); }
    bool MoveDown(int row) { return Exchange(row, row + 1); }

    // The first values of each field as texts, at most `count`; none in a new table.
    std::vector<QStringList> FirstValues(int count) const;

private:
    bool HasRow(int row) const { return row >= 0 && size_t(row) < design_.fields.size(); }
    bool Exchange(int upper, int selectedAfterwards);
    bool Tell(const std::optional<UserMessage>& fault); // false when there is one
    // The list becomes `wanted`, and so does an existing table. `name` is selected afterwards.
    bool Apply(const std::vector<FieldDesign>& wanted, const QString& name, const DesignRun::LastStep& last = {});
    bool Finish(DesignRun::Outcome outcome);
    bool RenameField(int row, const QString& newName);
    void SelectName(const QString& name);

    DbConnection& connection_;
    DatabaseLocation database_;
    UserPrompt& prompt_;
    DesignHost& host_;
    DesignRun run_;
    TableDesign design_;
    bool isNew_ = true;
    int selected_ = -1;
};

} // namespace mirel
