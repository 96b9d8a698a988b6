// Random actions on a random form: nothing crashes, whatever rectangles, types and texts it holds, and undo leads
// back to the first state byte for byte.
#include "forms/design/expression_desk.h"
#include "forms/design/form_design.h"
#include "forms/design/properties.h"
#include "forms/store_bytes.h"

#include <cstdint>

using namespace mirel;

namespace {

QByteArray BytesOf(const FormDef& form)
{
    FormStore::Content content;
    content.forms.push_back(form);
    return WriteStore(content);
}

// Hands out the bytes of the input; zeros when they are used up.
class Bytes {
public:
    explicit Bytes(QByteArrayView bytes)
        : rest_(bytes)
    {
    }
    bool AtEnd() const { return rest_.isEmpty(); }
    uint8_t Next()
    {
        if (rest_.isEmpty())
            return 0;
        const auto byte = uint8_t(rest_.front());
        rest_ = rest_.sliced(1);
        return byte;
    }
    int Signed() { return int8_t(Next()); }

private:
    QByteArrayView rest_;
};

void Act(FormDesign& design, Bytes& bytes, QByteArray& copied)
{
    const int count = design.Count();
    const auto control = [&] { return count == 0 ? -1 : bytes.Next() % count; };
    switch (bytes.Next() % 16) {
    case 0:
        return count >= 60 ? design.SelectNone()
                           : design.AddControl(ControlTypes()[bytes.Next() % ControlTypes().size()].type,
                                               {bytes.Signed(), bytes.Signed()});
    case 1:
        return count > 0 ? design.SelectOnly(control()) : design.SelectNone();
    case 2:
        return count > 0 ? design.Toggle(control()) : design.SelectAll();
    case 3:
        return design.SelectWithin({bytes.Signed(), bytes.Signed(), bytes.Next(), bytes.Next()});
    case 4: {
        const QPoint at(bytes.Signed(), bytes.Signed());
        design.BeginDrag(bytes.Next() % 2 ? design.ZoneAt(at, 8) : HitZone(bytes.Next() % 10), at);
        for (int step = bytes.Next() % 4; step > 0; --step)
            design.DragTo({bytes.Signed(), bytes.Signed()});
        return bytes.Next() % 4 ? design.EndDrag() : design.CancelDrag();
    }
    case 5:
        return design.MoveBy(bytes.Signed(), bytes.Signed());
    case 6:
        return design.ResizeBy(bytes.Signed(), bytes.Signed());
    case 7:
        return design.Align(FormDesign::Edge(bytes.Next() % 4));
    case 8:
        return design.MakeSame(FormDesign::Like(bytes.Next() % 3));
    case 9:
        return design.DeleteSelected();
    case 10:
        copied = design.CopySelected();
        return;
    case 11:
        if (count < 60)
            (void)design.Paste(copied);
        return;
    case 12:
        return design.MoveInOrder(bytes.Signed());
    case 13:
        return design.InsertRecordCounter();
    case 14:
        if (const int which = control(); which >= 0) {
            const ControlProperty& row = ControlProperties()[bytes.Next() % ControlProperties().size()];
            const QString value =
                bytes.Next() % 2 ? QString::number(bytes.Signed()) : QString(bytes.Next() % 50, u'&');
            design.ChangeControl(
                which, [&](ControlDef& def) { row.write(def, value); }, row.read(design.Control(which)));
        }
        return;
    default:
        return bytes.Next() % 2 ? design.Undo() : design.Redo();
    }
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    const QByteArrayView input(reinterpret_cast<const char*>(data), qsizetype(size));
    const qsizetype half = size == 0 ? 0 : qsizetype(uint8_t(input.front())) * input.size() / 256;
    FormStore store;
    (void)store.LoadFrom(input.first(half));
    FormDef form = store.Forms().empty() ? FormDef() : store.Forms().front();
    if (form.controls.size() > 60)
        form.controls.resize(60);
    FormDesign design(form);
    const QByteArray first = BytesOf(design.Form());
    QByteArray copied = input.first(half).toByteArray();
    Bytes bytes(input.sliced(half));
    for (int actions = 0; actions < 300 && !bytes.AtEnd(); ++actions)
        Act(design, bytes, copied);
    while (design.CanUndo())
        design.Undo();
    if (BytesOf(design.Form()) != first)
        __builtin_trap();
    while (design.CanRedo())
        design.Redo();
    (void)CirclesOf(design.Form());
    return 0;
}
