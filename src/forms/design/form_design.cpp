#include "forms/design/form_design.h"

#include "forms/design/new_controls.h"
#include "forms/store_bytes.h"

#include <QSet>

#include <algorithm>
#include <limits>
#include <numeric>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr int kPasteStepPx = 8; // beside the control that it is a copy of

qint32 FreeId(const FormDef& form)
{
    QSet<qint32> taken;
    qint32 greatest = 0;
    for (const ControlDef& control : form.controls) {
        taken.insert(control.controlId);
        greatest = std::max(greatest, control.controlId);
    }
    if (greatest < std::numeric_limits<qint32>::max())
        return greatest + 1;
    qint32 free = 1;
    while (taken.contains(free))
        ++free;
    return free;
}

bool HasName(const FormDef& form, const QString& name)
{
    return std::ranges::any_of(form.controls, [&name](const ControlDef& control) {
        return control.name.Text().compare(name, Qt::CaseInsensitive) == 0;
    });
}

QString FreeNameIn(const FormDef& form, const QString& stem, int from)
{
    QSet<QString> taken;
    for (const ControlDef& control : form.controls)
        taken.insert(control.name.Text().toCaseFolded());
    for (int number = from;; ++number) {
        const QString digits = QString::number(number);
        const QString name = stem.left(kMaxNameLength - digits.size()) + digits;
        if (!taken.contains(name.toCaseFolded()))
            return name;
    }
}

// The form is as large as what is put onto it.
void GrowFor(FormDef& form, const ControlDef& control)
{
    constexpr qint64 kMargin = 4;
    constexpr qint64 kLargest = 8000;
    const Edges place = Edges::Of(control);
    if (place.right + kMargin > form.width && place.right < kLargest)
        form.width = qint32(place.right + kMargin);
    if (place.bottom + kMargin > form.height && place.bottom < kLargest)
        form.height = qint32(place.bottom + kMargin);
}

std::vector<int> LastOf(const FormDef& form, size_t count)
{
    std::vector<int> last(count);
    std::iota(last.begin(), last.end(), int(form.controls.size() - count));
    return last;
}

} // namespace

FormDesign::FormDesign(FormDef form)
{
    state_.form = std::move(form);
}

// --- selection ----------------------------------------------------------------------------------------------

bool FormDesign::IsSelected(int control) const
{
    return std::ranges::find(state_.selection, control) != state_.selection.end();
}

int FormDesign::TheSelected() const
{
    return state_.selection.size() == 1 ? state_.selection.front() : -1;
}

int FormDesign::ControlAt(QPoint point) const
{
    for (int control = Count() - 1; control >= 0; --control) {
        if (Edges::Of(Control(control)).Contains(point))
            return control;
    }
    return -1;
}

void FormDesign::Select(std::vector<int> controls)
{
    if (state_.selection == controls)
        return;
    state_.selection = std::move(controls);
    history_.EndMerging();
    Touch();
}

void FormDesign::SelectAll()
{
    std::vector<int> all(state_.form.controls.size());
    std::iota(all.begin(), all.end(), 0);
    Select(std::move(all));
}

void FormDesign::Toggle(int control)
{
    std::vector<int> controls = state_.selection;
    if (std::erase(controls, control) == 0)
        controls.push_back(control);
    Select(std::move(controls));
}

void FormDesign::SelectWithin(const QRect& area)
{
    std::vector<int> met;
    for (int control = 0; control < Count(); ++control) {
        if (Edges::Of(Control(control)).Meets(area))
            met.push_back(control);
    }
    Select(std::move(met));
}

void FormDesign::SelectNext(int by)
{
    if (Count() == 0)
        return;
    const int from = state_.selection.empty() ? (by > 0 ? -1 : 0) : state_.selection.back();
    SelectOnly((from + by % Count() + Count()) % Count());
}

// --- drag ---------------------------------------------------------------------------------------------------

HitZone FormDesign::ZoneAt(QPoint point, int handleSize) const
{
    if (const int only = TheSelected(); only >= 0)
        return mirel::ZoneAt(Edges::Of(Control(only)), handleSize, point);
    const bool onOne = std::ranges::any_of(
        state_.selection, [&](int control) { return Edges::Of(Control(control)).Contains(point); });
    return onOne ? HitZone::Move : HitZone::None;
}

void FormDesign::BeginDrag(HitZone zone, QPoint at)
{
    beforeDrag_ = state_;
    zone_ = state_.selection.empty() ? HitZone::None : zone;
    lastPoint_ = at;
}

void FormDesign::DragTo(QPoint point)
{
    if (!IsDragging())
        return;
    const QPoint step = point - lastPoint_;
    lastPoint_ = point; // also where the step is refused
    for (const int each : state_.selection) {
        ControlDef& control = state_.form.controls[size_t(each)];
        (void)Dragged(Edges::Of(control), zone_, step.x(), step.y()).PutInto(control);
    }
    Touch();
}

void FormDesign::EndDrag()
{
    if (!IsDragging())
        return;
    zone_ = HitZone::None;
    Commit(std::move(beforeDrag_));
}

void FormDesign::CancelDrag()
{
    if (!IsDragging())
        return;
    zone_ = HitZone::None;
    state_ = std::move(beforeDrag_);
    Touch();
}

void FormDesign::MoveBy(int dx, int dy)
{
    ChangeSelected(
        [dx, dy](ControlDef& control) {
            (void)Dragged(Edges::Of(control), HitZone::Move, dx, dy).PutInto(control);
        },
        u"move"_s);
}

void FormDesign::ResizeBy(int dx, int dy)
{
    ChangeSelected(
        [dx, dy](ControlDef& control) {
            (void)Dragged(Edges::Of(control), HitZone::BottomRight, dx, dy).PutInto(control);
        },
        u"resize"_s);
}

// --- changes ------------------------------------------------------------------------------------------------

void FormDesign::Commit(DesignHistory::State before, const QString& mergeKey)
{
    (void)history_.Add(before, state_, mergeKey);
    Touch();
}

void FormDesign::Change(const std::function<void(FormDef& form)>& change, const QString& mergeKey)
{
    DesignHistory::State before = state_;
    change(state_.form);
    std::erase_if(state_.selection, [this](int control) { return control >= Count(); });
    Commit(std::move(before), mergeKey);
}

void FormDesign::ChangeControl(int control, const std::function<void(ControlDef& control)>& change,
                               const QString& mergeKey)
{
    Change([&](FormDef& form) { change(form.controls[size_t(control)]); }, mergeKey);
}

void FormDesign::ChangeSelected(const std::function<void(ControlDef& control)>& change, const QString& mergeKey)
{
    const std::vector<int> selected = state_.selection;
    Change(
        [&](FormDef& form) {
            for (const int control : selected)
                change(form.controls[size_t(control)]);
        },
        mergeKey);
}

QString FormDesign::FreeName(QStringView stem) const
{
    return FreeNameIn(Form(), stem.toString(), 1);
}

void FormDesign::AddControl(ControlType type, QPoint at)
{
    DesignHistory::State before = state_;
    ControlDef control = NewControl(state_.form, type, FreeName(TypeOf(type).stem), at);
    control.controlId = FreeId(state_.form);
    GrowFor(state_.form, control);
    state_.form.AddControl(std::move(control));
    state_.selection = LastOf(state_.form, 1);
    Commit(std::move(before));
}

void FormDesign::InsertRecordCounter()
{
    DesignHistory::State before = state_;
    ControlDef counter = NewRecordCounter(state_.form);
    if (HasName(state_.form, counter.name.Text())) {
        counter.name.Set(FreeNameIn(state_.form, counter.name.Text(), 2));
        counter.controlId = FreeId(state_.form);
    }
    GrowFor(state_.form, counter);
    state_.form.AddControl(std::move(counter));
    state_.selection = LastOf(state_.form, 1);
    Commit(std::move(before));
}

void FormDesign::AddField(const ResultField& field, QPoint at)
{
    DesignHistory::State before = state_;
    for (ControlDef& control : FieldControls(state_.form, field, at)) {
        control.controlId = FreeId(state_.form);
        const QString name = control.name.Text();
        if (Has(control.type, HoldsValue) && HasName(state_.form, name))
            control.name.Set(FreeNameIn(state_.form, name, 2));
        GrowFor(state_.form, control);
        state_.form.AddControl(std::move(control));
    }
    state_.selection = LastOf(state_.form, 1);
    Commit(std::move(before));
}

void FormDesign::DeleteSelected()
{
    DesignHistory::State before = state_;
    std::vector<int> gone = state_.selection;
    std::ranges::sort(gone, std::ranges::greater());
    for (const int control : gone)
        state_.form.controls.erase(state_.form.controls.begin() + control);
    state_.selection.clear();
    Commit(std::move(before));
}

void FormDesign::DeleteAll()
{
    DesignHistory::State before = state_;
    state_.form.controls.clear();
    state_.selection.clear();
    Commit(std::move(before));
}

void FormDesign::ReplaceBy(const FormDef& form, Name name)
{
    DesignHistory::State before = state_;
    state_.form.CopyFrom(form);
    if (name == Name::Keep)
        state_.form.name = before.form.name;
    state_.selection.clear();
    Commit(std::move(before));
}

void FormDesign::Align(Edge edge)
{
    if (state_.selection.empty())
        return;
    const Edges model = Edges::Of(Control(state_.selection.front()));
    ChangeSelected([edge, model](ControlDef& control) {
        Edges place = Edges::Of(control);
        const auto shift = [&place](qint64 dx, qint64 dy) {
            place = {place.left + dx, place.top + dy, place.right + dx, place.bottom + dy};
        };
        switch (edge) {
        case Edge::Left:
            shift(model.left - place.left, 0);
            break;
        case Edge::Right:
            shift(model.right - place.right, 0);
            break;
        case Edge::Top:
            shift(0, model.top - place.top);
            break;
        case Edge::Bottom:
            shift(0, model.bottom - place.bottom);
            break;
        }
        (void)place.PutInto(control);
    });
}

void FormDesign::MakeSame(Like like)
{
    if (state_.selection.empty())
        return;
    const ControlDef model = Control(state_.selection.front());
    ChangeSelected([like, &model](ControlDef& control) {
        if (like != Like::Height)
            control.width = model.width;
        if (like != Like::Width)
            control.height = model.height;
    });
}

void FormDesign::MoveInOrder(int by)
{
    const int from = TheSelected();
    const int to = std::clamp(from + by, 0, Count() - 1);
    if (from < 0 || to == from)
        return;
    DesignHistory::State before = state_;
    std::vector<ControlDef>& controls = state_.form.controls;
    ControlDef moved = std::move(controls[size_t(from)]);
    controls.erase(controls.begin() + from);
    controls.insert(controls.begin() + to, std::move(moved));
    state_.selection = {to};
    Commit(std::move(before));
}

// --- copy and paste -----------------------------------------------------------------------------------------

QByteArray FormDesign::CopySelected() const
{
    std::vector<int> inOrder = state_.selection;
    std::ranges::sort(inOrder);
    FormDef carrier;
    for (const int control : inOrder)
        carrier.AddControl(Control(control));
    FormStore::Content content;
    content.forms.push_back(std::move(carrier));
    return WriteStore(content);
}

bool FormDesign::Paste(QByteArrayView bytes)
{
    FormStore::Content content;
    (void)ReadStore(bytes, content);
    if (content.forms.empty() || content.forms.front().controls.empty())
        return false;
    std::vector<ControlDef>& pasted = content.forms.front().controls;
    DesignHistory::State before = state_;
    FormDef& form = state_.form;
    const auto covers = [&form, &pasted](int shift) {
        return std::ranges::any_of(form.controls, [&](const ControlDef& control) {
            return qint64(control.left) == qint64(pasted.front().left) + shift &&
                   qint64(control.top) == qint64(pasted.front().top) + shift;
        });
    };
    int shift = 0;
    while (covers(shift))
        shift += kPasteStepPx;
    for (ControlDef& control : pasted) {
        control.controlId = FreeId(form);
        const QString name = control.name.Text();
        if (!Has(control.type, HasCaption) && HasName(form, name))
            control.name.Set(FreeNameIn(form, name, 2));
        (void)Dragged(Edges::Of(control), HitZone::Move, shift, shift).PutInto(control);
        form.AddControl(std::move(control));
    }
    state_.selection = LastOf(form, pasted.size());
    Commit(std::move(before));
    return true;
}

// --- the way back -------------------------------------------------------------------------------------------

void FormDesign::Undo()
{
    CancelDrag();
    if (!CanUndo())
        return;
    history_.Undo(state_);
    history_.EndMerging();
    Touch();
}

void FormDesign::Redo()
{
    CancelDrag();
    if (!CanRedo())
        return;
    history_.Redo(state_);
    history_.EndMerging();
    Touch();
}

} // namespace mirel
