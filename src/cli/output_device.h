#pragma once

#include "cli/output.h"

#include <QIODevice>

namespace mirel::cli {

// The program's output as a QIODevice. The output must outlive it.
class OutputDevice : public QIODevice {
public:
    explicit OutputDevice(Output& output)
        : output_(output)
    {
        open(QIODevice::WriteOnly | QIODevice::Unbuffered);
    }

protected:
    qint64 readData(char*, qint64) override { return -1; }
    qint64 writeData(const char* bytes, qint64 size) override
    {
        output_.Write({bytes, size_t(size)});
        return output_.HasFailed() ? -1 : size;
    }

private:
    Output& output_;
};

} // namespace mirel::cli
