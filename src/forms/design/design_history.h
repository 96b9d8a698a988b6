#pragma once

#include "forms/form_records.h"

#include <QString>

#include <optional>
#include <vector>

namespace mirel {

// The way back through the changes of a form, without limit. A step keeps what it changed: the run of controls
// that differ, and the form's own fields where they do.
class DesignHistory {
public:
    struct State {
        FormDef form;
        std::vector<int> selection;
    };

    // Keeps the step from `before` to `after`; steps that were taken back are forgotten. A step with the key of
    // the one before joins it, so that typing a name is one step. False: they do not differ.
    bool Add(const State& before, const State& after, const QString& mergeKey);
    // The next step does not join this one.
    void EndMerging() { mergeKey_.clear(); }

    bool CanUndo() const { return done_ > 0; }
    bool CanRedo() const { return done_ < int(steps_.size()); }
    void Undo(State& state);
    void Redo(State& state);

    // Whether the state is not the one that was saved last.
    bool IsModified() const { return saved_ != done_; }
    void MarkSaved();
    void MarkUnsaved() { saved_ = -1; } // no state is the saved one

private:
    struct Side {
        std::optional<FormDef> form; // without controls; none: the step leaves the form's own fields alone
        std::vector<ControlDef> controls;
        std::vector<int> selection;
    };
    struct Step {
        size_t first = 0; // of the controls that differ
        Side before;
        Side after;
    };
    static Step StepBetween(const State& before, const State& after);
    static void Replace(State& state, size_t first, const Side& from, const Side& to);

    std::vector<Step> steps_;
    int done_ = 0;  // steps in force
    int saved_ = 0; // steps that were in force when the form was saved; -1: none
    QString mergeKey_;
};

} // namespace mirel
