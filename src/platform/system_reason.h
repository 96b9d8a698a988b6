#pragma once

#include <QString>

class QIODevice;

namespace mirel {

// Why the system refused a device its last call: in the language of the program where it is one of the reasons
// that people meet, otherwise as the C library words it.
QString SystemReason(const QIODevice& device);

} // namespace mirel
