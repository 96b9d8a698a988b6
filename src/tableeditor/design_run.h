#pragma once

#include "tableeditor/design_plan.h"
#include "tableeditor/value_survey.h"

#include <functional>
#include <optional>
#include <vector>

namespace mirel {

// Carries designs of tables out on one database, each as one transaction: a run that fails leaves the table as it
// was, and tells why through the prompt. Questions are asked before a transaction begins; where another program
// has added values meanwhile to those that were said to be lost, they are asked again.
//
// Connection and prompt must outlive it.
class DesignRun {
public:
    enum class Outcome {
        Done,
        Refused, // by the user or by the database, which was told
        Stale,   // the table is not what it was taken for; nothing was told
    };
    // Done last in the transaction; false takes it back.
    using LastStep = std::function<bool()>;

    DesignRun(DbConnection& connection, DatabaseLocation database, UserPrompt& prompt)
        : connection_(connection)
        , database_(std::move(database))
        , prompt_(prompt)
    {
    }

    // Asks nothing.
    bool Create(const TableDesign& design);
    // Says how many values a dropped field or another type puts at stake, and asks.
    Outcome Apply(const TableDesign& current, const std::vector<FieldDesign>& wanted, const LastStep& last = {});
    Outcome RenameTable(const TableDesign& current, const QString& newName, const LastStep& last = {});
    // Asks, and says how many records go.
    Outcome DropTable(const QString& table);

private:
    struct Stake {
        std::vector<qint64> dropped; // a number of values for each field that goes
        std::vector<ValuesAtStake> converted;

        bool Exceeds(const Stake& told) const;
    };
    // Does the steps in a transaction, which is committed when they are done. What they have to tell is told
    // afterwards.
    template <typename Steps>
    Outcome InTransaction(Steps steps);

    std::optional<Stake> Survey(const TableDesign& current, const DesignPlan& plan, UserPrompt& prompt);
    bool AllConvert(const TableDesign& current, const DesignPlan& plan, const Stake& stake);
    bool Ask(const TableDesign& current, const DesignPlan& plan, const Stake& stake);
    // Whether the table is still what it was taken for.
    Outcome CheckUnchanged(const TableDesign& current, UserPrompt& prompt);
    Outcome Execute(const QStringList& statements, UserPrompt& prompt);

    DbConnection& connection_;
    DatabaseLocation database_;
    UserPrompt& prompt_;
};

} // namespace mirel
