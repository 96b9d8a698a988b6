#include "platform/ui/window_place.h"

#include <QScreen>
#include <QWidget>

namespace mirel {
namespace {

const QString kSection = QStringLiteral("Window");
constexpr QSize kSmallestDesktop(480, 360);

} // namespace

void RestorePlace(QWidget& window, const Profile& profile, const QString& key, QSize firstSize)
{
    const QByteArray place = QByteArray::fromBase64(profile.ReadText(kSection, key, {}).toLatin1());
    if (!place.isEmpty() && window.restoreGeometry(place))
        return;
    const QSize screen = window.screen()->availableSize();
    window.resize(firstSize.boundedTo(screen));
    if (window.size() != firstSize)
        window.setWindowState(Qt::WindowMaximized);
}

void KeepPlace(const QWidget& window, Profile& profile, const QString& key)
{
    profile.WriteText(kSection, key, QString::fromLatin1(window.saveGeometry().toBase64()));
}

bool IsHandheldSize(QSize window)
{
    return window.width() < kSmallestDesktop.width() || window.height() < kSmallestDesktop.height();
}

void FillSmallWindow(QWidget& dialog, const QWidget& window)
{
    const QWidget& whole = *window.window(); // a view may be a part of it
    if (IsHandheldSize(whole.size()))
        dialog.setGeometry(whole.geometry());
}

} // namespace mirel
