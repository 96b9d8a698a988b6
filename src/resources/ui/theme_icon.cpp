#include "resources/ui/theme_icon.h"

#include <QApplication>
#include <QFile>
#include <QIconEngine>
#include <QPainter>
#include <QPalette>
#include <QPixmapCache>
#include <QSvgRenderer>

// A resource in a static library is linked only when it is asked for; the macro wants the global namespace.
static void LinkDrawings()
{
    Q_INIT_RESOURCE(icons);
}

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

bool ownIconsOnly = false;

// One of our drawings, a stencil in black, inked when it is painted: so a change of the palette needs no new
// icons.
class InkEngine : public QIconEngine {
public:
    explicit InkEngine(QString file)
        : file_(std::move(file))
    {
    }

    void paint(QPainter* painter, const QRect& rect, QIcon::Mode mode, QIcon::State state) override
    {
        const qreal ratio = painter->device()->devicePixelRatio();
        painter->drawPixmap(rect, scaledPixmap(rect.size() * ratio, mode, state, ratio));
    }

    QPixmap pixmap(const QSize& size, QIcon::Mode mode, QIcon::State state) override
    {
        return scaledPixmap(size, mode, state, 1.0);
    }

    // `size` is in pixels of the device.
    QPixmap scaledPixmap(const QSize& size, QIcon::Mode mode, QIcon::State, qreal) override
    {
        const QColor ink = Ink(mode);
        const QString key = u"mirel/%1/%2x%3/%4"_s.arg(file_, QString::number(size.width()),
                                                       QString::number(size.height()), ink.name(QColor::HexArgb));
        QPixmap inked;
        if (QPixmapCache::find(key, &inked))
            return inked;
        inked = QPixmap(size);
        inked.fill(Qt::transparent);
        QPainter painter(&inked);
        QSvgRenderer renderer(file_);
        renderer.setAspectRatioMode(Qt::KeepAspectRatio);
        renderer.render(&painter, QRectF(QPointF(), QSizeF(size)));
        painter.setCompositionMode(QPainter::CompositionMode_SourceIn);
        painter.fillRect(inked.rect(), ink);
        painter.end();
        QPixmapCache::insert(key, inked);
        return inked;
    }

    QIconEngine* clone() const override { return new InkEngine(*this); }
    QString key() const override { return u"mirel-ink"_s; }
    bool isNull() override { return false; }

private:
    static QColor Ink(QIcon::Mode mode)
    {
        const QPalette palette = QGuiApplication::palette();
        switch (mode) {
        case QIcon::Disabled:
            return palette.color(QPalette::Disabled, QPalette::ButtonText);
        case QIcon::Selected:
            return palette.color(QPalette::Active, QPalette::HighlightedText);
        case QIcon::Normal:
        case QIcon::Active:
            break;
        }
        return palette.color(QPalette::Active, QPalette::ButtonText);
    }

    QString file_;
};

} // namespace

QIcon ThemeIcon(QStringView name)
{
    const QString text = name.toString();
    if (!ownIconsOnly && !name.startsWith(u"mirel-") && QIcon::hasThemeIcon(text))
        return QIcon::fromTheme(text);
    LinkDrawings();
    const QString file = u":/icons/%1.svg"_s.arg(text);
    return QFile::exists(file) ? QIcon(new InkEngine(file)) : QIcon();
}

void UseOwnIconsOnly()
{
    ownIconsOnly = true;
}

} // namespace mirel
