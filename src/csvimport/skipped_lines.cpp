#include "csvimport/skipped_lines.h"

namespace mirel {

bool SkippedLines::Add(const QByteArray& line)
{
    if (!file_) {
        file_ = std::make_unique<QSaveFile>(path_);
        if (!file_->open(QIODevice::WriteOnly) || file_->write(start_) != start_.size())
            return false;
    }
    if (file_->write(line) != line.size())
        return false;
    ++count_;
    return true;
}

bool SkippedLines::Commit()
{
    return !file_ || file_->commit();
}

} // namespace mirel
