#include "forms/control_run.h"

#include <algorithm>

namespace mirel {
namespace {

constexpr int kSecondWidth = 15;      // pixels that picker and button take off the box
constexpr qint64 kFarthest = 1 << 20; // a file may hold any numbers: sums of these stay within an int

} // namespace

ControlParts PartsOf(const ControlDef& control)
{
    const auto within = [](qint64 number, qint64 least) {
        return int(std::clamp<qint64>(number, least, kFarthest));
    };
    const QRect whole(within(control.left, -kFarthest), within(control.top, -kFarthest), within(control.width, 0),
                      within(control.height, 0));
    if (control.type != ControlType::EditBox)
        return {whole, {}};
    const int narrowed = std::max(whole.width() - kSecondWidth, 0);
    const QRect box(whole.left(), whole.top(), narrowed, whole.height());
    if (control.editKind == EditKind::DatePicker)
        return {box, whole};
    if (control.editKind == EditKind::Extendable)
        return {box, QRect(whole.left() + narrowed, whole.top(), whole.width() - narrowed, whole.height())};
    return {whole, {}};
}

} // namespace mirel
