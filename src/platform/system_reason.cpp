#include "platform/system_reason.h"

#include "resources/string_table.h"

#include <QIODevice>

#include <algorithm>
#include <array>
#include <cerrno>

namespace mirel {
namespace {

struct ReasonRow {
    int number; // an errno
    Str text;
};
constexpr std::array kReasons = {
    ReasonRow{ENOENT, Str::ReasonNotThere},     ReasonRow{EACCES, Str::ReasonNoPermission},
    ReasonRow{EPERM, Str::ReasonNotPermitted},  ReasonRow{ENOSPC, Str::ReasonDiskFull},
    ReasonRow{EDQUOT, Str::ReasonQuota},        ReasonRow{EROFS, Str::ReasonReadOnlyDisk},
    ReasonRow{EISDIR, Str::ReasonIsFolder},     ReasonRow{ENOTDIR, Str::ReasonNoFolder},
    ReasonRow{EEXIST, Str::ReasonExists},       ReasonRow{ENAMETOOLONG, Str::ReasonNameTooLong},
    ReasonRow{EFBIG, Str::ReasonFileTooLarge},  ReasonRow{EBUSY, Str::ReasonBusy},
    ReasonRow{EMFILE, Str::ReasonTooManyFiles}, ReasonRow{EIO, Str::ReasonDiskFault},
    ReasonRow{ETIMEDOUT, Str::ReasonTimeIsUp},
};

} // namespace

// A device keeps the words for its error and not the number, so the row is the one with the same words.
QString SystemReason(const QIODevice& device)
{
    const QString words = device.errorString();
    const auto row = std::ranges::find_if(
        kReasons, [&words](const ReasonRow& each) { return qt_error_string(each.number) == words; });
    return row == kReasons.end() ? words : StringText(row->text);
}

} // namespace mirel
