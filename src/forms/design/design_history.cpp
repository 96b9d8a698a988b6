#include "forms/design/design_history.h"

#include <algorithm>

namespace mirel {
namespace {

// The form's own fields.
FormDef HeadOf(const FormDef& form)
{
    FormDef head = form;
    head.controls.clear();
    return head;
}

} // namespace

DesignHistory::Step DesignHistory::StepBetween(const State& before, const State& after)
{
    const std::vector<ControlDef>& a = before.form.controls;
    const std::vector<ControlDef>& b = after.form.controls;
    const size_t shorter = std::min(a.size(), b.size());
    size_t first = 0;
    while (first < shorter && a[first] == b[first])
        ++first;
    size_t same = 0; // at the end
    while (same < shorter - first && a[a.size() - 1 - same] == b[b.size() - 1 - same])
        ++same;
    Step step;
    step.first = first;
    step.before.controls.assign(a.begin() + qptrdiff(first), a.end() - qptrdiff(same));
    step.after.controls.assign(b.begin() + qptrdiff(first), b.end() - qptrdiff(same));
    FormDef headBefore = HeadOf(before.form);
    FormDef headAfter = HeadOf(after.form);
    if (!(headBefore == headAfter)) {
        step.before.form = std::move(headBefore);
        step.after.form = std::move(headAfter);
    }
    step.before.selection = before.selection;
    step.after.selection = after.selection;
    return step;
}

void DesignHistory::Replace(State& state, size_t first, const Side& from, const Side& to)
{
    std::vector<ControlDef> controls = std::move(state.form.controls);
    const auto begin = controls.begin() + qptrdiff(first);
    const auto place = controls.erase(begin, begin + qptrdiff(from.controls.size()));
    controls.insert(place, to.controls.begin(), to.controls.end());
    if (to.form)
        state.form = *to.form;
    state.form.controls = std::move(controls);
    state.selection = to.selection;
}

bool DesignHistory::Add(const State& before, const State& after, const QString& mergeKey)
{
    if (before.form == after.form)
        return false;
    const bool merges = !mergeKey.isEmpty() && mergeKey == mergeKey_ && done_ > 0 && !CanRedo() && saved_ != done_;
    mergeKey_ = mergeKey;
    if (saved_ > done_)
        saved_ = -1;
    steps_.resize(size_t(done_));
    if (merges) {
        State start = before;
        Undo(start);
        steps_.back() = StepBetween(start, after);
    } else {
        steps_.push_back(StepBetween(before, after));
    }
    done_ = int(steps_.size());
    return true;
}

void DesignHistory::Undo(State& state)
{
    const Step& step = steps_[size_t(--done_)];
    Replace(state, step.first, step.after, step.before);
}

void DesignHistory::Redo(State& state)
{
    const Step& step = steps_[size_t(done_++)];
    Replace(state, step.first, step.before, step.after);
}

void DesignHistory::MarkSaved()
{
    saved_ = done_;
    EndMerging();
}

} // namespace mirel
