#pragma once

#include "forms/control_types.h"
#include "forms/design/design_history.h"
#include "forms/design/hit_zone.h"
#include "provider/provider.h"

#include <QByteArray>
#include <QPoint>
#include <QRect>
#include <QString>

#include <functional>
#include <vector>

namespace mirel {

// A form on the drawing board: a working copy of its record, what is selected, a drag, and the way back.
//
// Controls count from 0 in the form's list order, which is the order of the Tab key; of controls that overlap the
// later one is on top. Places are in the form's pixels. Calls with an index out of range are the caller's mistake.
class FormDesign {
public:
    explicit FormDesign(FormDef form = {});

    const FormDef& Form() const { return state_.form; }
    int Count() const { return int(state_.form.controls.size()); }
    const ControlDef& Control(int control) const { return state_.form.controls[size_t(control)]; }
    // Grows with every change of the form or the selection.
    quint64 Revision() const { return revision_; }

    // --- selection ----------------------------------------------------------------------------------------

    // In the order of selecting: the first is what the others are aligned to and made like.
    const std::vector<int>& Selection() const { return state_.selection; }
    bool IsSelected(int control) const;
    int TheSelected() const;           // the only one; -1: none, or several
    int ControlAt(QPoint point) const; // the topmost; -1: none
    void Select(std::vector<int> controls);
    void SelectOnly(int control) { Select({control}); }
    void SelectNone() { Select({}); }
    void SelectAll();
    void Toggle(int control);
    void SelectWithin(const QRect& area); // what the rubber band meets
    void SelectNext(int by);              // round the list; from none to the first or the last

    // --- drag ---------------------------------------------------------------------------------------------

    // The zone of the point on what is selected: handles on one control; of several, Move on each.
    HitZone ZoneAt(QPoint point, int handleSize) const;
    void BeginDrag(HitZone zone, QPoint at);
    bool IsDragging() const { return zone_ != HitZone::None; }
    bool IsMoving() const { return zone_ == HitZone::Move; } // what is dragged keeps its size
    HitZone Zone() const { return zone_; }
    void DragTo(QPoint point);
    void EndDrag();    // all its steps are one for Undo
    void CancelDrag(); // as before it

    void MoveBy(int dx, int dy);   // the arrow keys; one after the other are one step
    void ResizeBy(int dx, int dy); // likewise

    // --- changes: each is one step for Undo ---------------------------------------------------------------

    // Any change of the form. Changes with the same key, one after the other, are one step.
    void Change(const std::function<void(FormDef& form)>& change, const QString& mergeKey = {});
    void ChangeControl(int control, const std::function<void(ControlDef& control)>& change,
                       const QString& mergeKey = {});
    void ChangeSelected(const std::function<void(ControlDef& control)>& change, const QString& mergeKey = {});

    // With a free name, in the form's font, selected.
    void AddControl(ControlType type, QPoint at);
    void InsertRecordCounter();
    // A label and the control that fits the field's type, selected.
    void AddField(const ResultField& field, QPoint at);
    void DeleteSelected();
    void DeleteAll();
    // Another form in place of this one's; keeps its own name where `keepName` says so.
    enum class Name { Keep, Take };
    void ReplaceBy(const FormDef& form, Name name);

    enum class Edge { Left, Right, Top, Bottom };
    void Align(Edge edge);
    enum class Like { Size, Height, Width };
    void MakeSame(Like like);
    void MoveInOrder(int by); // the one selected control, earlier or later in the list

    // The selected controls as bytes, to be pasted here or on another form. Foreign bytes may be pasted; false:
    // they hold no controls.
    QByteArray CopySelected() const;
    bool Paste(QByteArrayView bytes);

    // --- the way back -------------------------------------------------------------------------------------

    bool CanUndo() const { return history_.CanUndo(); }
    bool CanRedo() const { return history_.CanRedo(); }
    void Undo();
    void Redo();
    bool IsModified() const { return history_.IsModified(); }
    void MarkSaved() { history_.MarkSaved(); }
    void MarkUnsaved() { history_.MarkUnsaved(); }

    // Names that no control has: "EditBox3", "Total2".
    QString FreeName(QStringView stem) const;

private:
    void Commit(DesignHistory::State before, const QString& mergeKey = {});
    void Touch() { ++revision_; }

    DesignHistory::State state_;
    DesignHistory history_;
    DesignHistory::State beforeDrag_;
    HitZone zone_ = HitZone::None;
    QPoint lastPoint_;
    quint64 revision_ = 0;
};

} // namespace mirel
