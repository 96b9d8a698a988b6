#include "forms/ui/field_list.h"

#include "data/field_names.h"
#include "forms/ui/design_surface.h"
#include "platform/ui/look_roles.h"
#include "platform/ui/window_place.h"
#include "resources/string_table.h"

#include <QApplication>
#include <QDialogButtonBox>
#include <QMimeData>
#include <QPainter>
#include <QPushButton>
#include <QStyledItemDelegate>
#include <QVBoxLayout>

namespace mirel {
namespace {

constexpr int kTypeRole = Qt::UserRole + 1;

// The field's name, and its type dimmed at the right.
class FieldDelegate : public QStyledItemDelegate {
public:
    using QStyledItemDelegate::QStyledItemDelegate;

    void paint(QPainter* painter, const QStyleOptionViewItem& option, const QModelIndex& index) const override
    {
        QStyleOptionViewItem item = option;
        initStyleOption(&item, index);
        const QString type = index.data(kTypeRole).toString();
        const int typeWidth = item.fontMetrics.horizontalAdvance(type);
        const int room = item.rect.width() - typeWidth - 2 * spacing::kGap;
        item.text = item.fontMetrics.elidedText(item.text, Qt::ElideMiddle, std::max(room, item.rect.width() / 2));
        const QStyle* style = item.widget ? item.widget->style() : QApplication::style();
        style->drawControl(QStyle::CE_ItemViewItem, &item, painter, item.widget);
        if (room < item.rect.width() / 2)
            return;
        const bool selected = (item.state & QStyle::State_Selected) != 0;
        painter->setPen(selected ? item.palette.color(QPalette::HighlightedText)
                                 : ColorOfRole(LookRole::Dim, item.palette));
        painter->drawText(item.rect.adjusted(0, 0, -spacing::kTight, 0), Qt::AlignRight | Qt::AlignVCenter, type);
    }
};

} // namespace

FieldList::FieldList(QWidget* parent)
    : QListWidget(parent)
{
    setDragEnabled(true);
    setDragDropMode(QAbstractItemView::DragOnly);
    setItemDelegate(new FieldDelegate(this));
}

QMimeData* FieldList::mimeData(const QList<QListWidgetItem*>& items) const
{
    if (items.isEmpty())
        return nullptr;
    auto* dragged = new QMimeData;
    dragged->setData(QLatin1StringView(DesignSurface::kFieldMime),
                     items.first()->data(Qt::UserRole).toString().toUtf8());
    return dragged;
}

void FillFieldList(QListWidget& list, const std::vector<ResultField>& fields)
{
    list.clear();
    for (const ResultField& field : fields) {
        auto* item = new QListWidgetItem(field.name, &list);
        item->setData(Qt::UserRole, field.name);
        QString type;
        if (TypeNameOfField(field.type, type))
            item->setData(kTypeRole, type);
        item->setToolTip(field.name.toHtmlEscaped());
    }
}

CFieldsDialog::CFieldsDialog(const std::vector<ResultField>& fields, QWidget* parent)
    : QDialog(parent)
    , list_(new FieldList(this))
{
    setWindowTitle(StringText(Str::DeskFields));
    list_->setAccessibleName(windowTitle());
    list_->setDragEnabled(false);
    list_->setSelectionMode(QAbstractItemView::ExtendedSelection);
    FillFieldList(*list_, fields);
    list_->setCurrentRow(0);
    auto* buttons = new QDialogButtonBox(QDialogButtonBox::NoButton, this);
    QPushButton* add = buttons->addButton(StringText(Str::MakerDialogAdd), QDialogButtonBox::ActionRole);
    QPushButton* close = buttons->addButton(StringText(Str::MakerDialogClose), QDialogButtonBox::RejectRole);
    connect(add, &QPushButton::clicked, this, &CFieldsDialog::Take);
    connect(close, &QPushButton::clicked, this, &QDialog::reject);
    connect(list_, &QListWidget::itemActivated, this, &CFieldsDialog::Take);
    add->setDefault(true);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(spacing::kTight, spacing::kTight, spacing::kTight, spacing::kTight);
    column->addWidget(list_, 1);
    column->addWidget(buttons);
    const int line = fontMetrics().lineSpacing();
    resize(line * 20, line * 24);
    FillSmallWindow(*this, *parent->window());
}

void CFieldsDialog::Take()
{
    int last = list_->currentRow();
    for (int row = 0; row < list_->count(); ++row) {
        if (!list_->item(row)->isSelected())
            continue;
        Q_EMIT fieldChosen(list_->item(row)->data(Qt::UserRole).toString());
        last = row;
    }
    list_->clearSelection();
    list_->setCurrentRow(std::min(last + 1, list_->count() - 1));
}

} // namespace mirel
