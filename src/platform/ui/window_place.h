#pragma once

#include "platform/profile.h"

#include <QSize>

class QWidget;

namespace mirel {

// Where a window stood when it was closed, kept under `key` in the profile's section "Window".
//
// Without a place to come back to the window takes `firstSize`; on a screen too small for that it fills the
// screen.
void RestorePlace(QWidget& window, const Profile& profile, const QString& key, QSize firstSize);
void KeepPlace(const QWidget& window, Profile& profile, const QString& key);

// Whether a window of that size is a handheld's: dialogs then fill it.
bool IsHandheldSize(QSize window);
// A dialog over a window of that size fills it.
void FillSmallWindow(QWidget& dialog, const QWidget& window);

} // namespace mirel
