#pragma once

class QDialog;
class QDialogButtonBox;

namespace mirel {

// OK and Cancel for the foot of a dialog: they accept and reject it.
QDialogButtonBox* OkAndCancel(QDialog& dialog);

} // namespace mirel
