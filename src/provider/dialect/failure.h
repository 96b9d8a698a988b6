#pragma once

#include "platform/hr.h"

#include <QString>

namespace mirel::dialect {

// Why a statement was refused.
struct Failure {
    Hr code = Hr::SyntaxError;
    QString context;   // for people: the place and what stands there; empty where the code says all
    qsizetype at = -1; // the place of a syntax error in the statement, from 0; its length: at the end
};

} // namespace mirel::dialect
