#include "querybuilder/ui/diagram_canvas.h"

#include "platform/ui/elided_label.h"
#include "platform/ui/look_roles.h"
#include "resources/string_table.h"
#include "resources/ui/theme_icon.h"

#include <QDropEvent>
#include <QHBoxLayout>
#include <QListWidget>
#include <QMenu>
#include <QMimeData>
#include <QMouseEvent>
#include <QPainter>
#include <QScrollBar>
#include <QToolButton>
#include <QVBoxLayout>

#include <algorithm>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr int kBoxWidth = 160;
constexpr int kLineHeight = 24; // a finger's
constexpr int kMostLines = 9;   // of a box before it scrolls
constexpr int kBetween = 72;
constexpr int kStub = 12; // of a line, straight away from its box
constexpr int kJoinButton = 24;
const QString kFieldFormat = u"application/x-mirel-diagram-field"_s;
const QChar kPartSeparator(u'\n');

// The fields of a box. What is dragged names its table and field.
class FieldList : public QListWidget {
public:
    FieldList(QString source, std::function<void(const QString&, const QString&, const QString&)> joined,
              QWidget* parent)
        : QListWidget(parent)
        , source_(std::move(source))
        , joined_(std::move(joined))
    {
        setDragDropMode(QAbstractItemView::DragDrop);
        setDefaultDropAction(Qt::LinkAction);
        setFrameShape(QFrame::NoFrame);
        setTextElideMode(Qt::ElideMiddle);
        setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    }

protected:
    QStringList mimeTypes() const override { return {kFieldFormat}; }
    Qt::DropActions supportedDropActions() const override { return Qt::LinkAction | Qt::CopyAction; }
    QMimeData* mimeData(const QList<QListWidgetItem*>& items) const override
    {
        auto* dragged = new QMimeData;
        if (!items.isEmpty())
            dragged->setData(kFieldFormat, (source_ + kPartSeparator + items.first()->text()).toUtf8());
        return dragged;
    }
    void dropEvent(QDropEvent* event) override
    {
        const QString dragged = QString::fromUtf8(event->mimeData()->data(kFieldFormat));
        const QListWidgetItem* target = itemAt(event->position().toPoint());
        event->setDropAction(Qt::LinkAction);
        event->accept();
        if (target && dragged.contains(kPartSeparator))
            joined_(dragged.section(kPartSeparator, 0, 0), dragged.section(kPartSeparator, 1), target->text());
    }

private:
    QString source_;
    std::function<void(const QString&, const QString&, const QString&)> joined_;
};

} // namespace

DiagramBox::DiagramBox(DiagramTable table, const std::vector<FieldLists::Field>& fields, QWidget* parent)
    : QFrame(parent)
    , table_(std::move(table))
    , title_(new QWidget(this))
    , fields_(new FieldList(
          table_.Source(),
          [this](const QString& source, const QString& field, const QString& target) {
              Q_EMIT joined(source, field, target);
          },
          this))
{
    setFrameShape(QFrame::StyledPanel);
    setAutoFillBackground(true);
    setBackgroundRole(QPalette::Base);
    setObjectName(table_.Source());
    auto* name = new ElidedLabel(title_);
    QFont bold = name->font();
    bold.setBold(true);
    name->setFont(bold);
    name->SetText(table_.alias.isEmpty() ? table_.table : u"%1 (%2)"_s.arg(table_.alias, table_.table));
    name->setToolTip(table_.table.toHtmlEscaped());
    name->setAttribute(Qt::WA_TransparentForMouseEvents);
    auto* remove = new QToolButton(title_);
    remove->setIcon(ThemeIcon(u"window-close"));
    remove->setAutoRaise(true);
    remove->setToolTip(StringText(Str::DiagramRemoveTable));
    remove->setAccessibleName(StringText(Str::DiagramRemoveTable));
    remove->setFocusPolicy(Qt::StrongFocus);
    connect(remove, &QToolButton::clicked, this, &DiagramBox::removeRequested);
    auto* line = new QHBoxLayout(title_);
    line->setContentsMargins(spacing::kGap, 0, 0, 0);
    line->addWidget(name, 1);
    line->addWidget(remove);
    title_->setAutoFillBackground(true);
    title_->setBackgroundRole(QPalette::AlternateBase);
    title_->setCursor(Qt::SizeAllCursor);
    title_->installEventFilter(this);

    filling_ = true;
    for (const FieldLists::Field& field : fields) {
        auto* item = new QListWidgetItem(field.name, fields_);
        item->setFlags(item->flags() | Qt::ItemIsUserCheckable | Qt::ItemIsDragEnabled);
        item->setCheckState(Qt::Unchecked);
        item->setSizeHint({0, kLineHeight});
    }
    filling_ = false;
    fields_->setAccessibleName(table_.Source());
    fields_->setCurrentRow(0);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(1, 1, 1, 1);
    column->setSpacing(0);
    column->addWidget(title_);
    column->addWidget(fields_);
    const int rows = std::clamp(fields_->count(), 1, kMostLines);
    fields_->setFixedHeight(rows * kLineHeight + 2);
    setFixedWidth(kBoxWidth);
    connect(fields_, &QListWidget::itemChanged, this, [this](const QListWidgetItem* item) {
        if (!filling_)
            Q_EMIT ticked(item->text(), item->checkState() == Qt::Checked);
    });
    fields_->setContextMenuPolicy(Qt::CustomContextMenu);
    connect(fields_, &QWidget::customContextMenuRequested, this, [this](const QPoint& place) {
        if (const QListWidgetItem* item = fields_->currentItem())
            Q_EMIT joinMenuRequested(item->text(), fields_->viewport()->mapToGlobal(place));
    });
    connect(fields_->verticalScrollBar(), &QScrollBar::valueChanged, this, &DiagramBox::scrolled);
}

void DiagramBox::ShowTicks(const QueryDiagram& diagram)
{
    filling_ = true;
    for (int row = 0; row < fields_->count(); ++row) {
        QListWidgetItem* item = fields_->item(row);
        item->setCheckState(diagram.Shows(table_.Source(), item->text()) ? Qt::Checked : Qt::Unchecked);
    }
    filling_ = false;
}

int DiagramBox::LineOf(const QString& field) const
{
    const auto found = fields_->findItems(field, Qt::MatchFixedString);
    const int line = found.isEmpty() ? 0 : fields_->visualItemRect(found.first()).center().y();
    return y() + fields_->y() + std::clamp(line, 0, fields_->height());
}

bool DiagramBox::eventFilter(QObject* watched, QEvent* event)
{
    if (watched != title_)
        return QFrame::eventFilter(watched, event);
    if (event->type() == QEvent::MouseButtonPress) {
        dragFrom_ = static_cast<QMouseEvent*>(event)->globalPosition().toPoint() - pos();
        raise();
        return true;
    }
    if (event->type() == QEvent::MouseMove && static_cast<QMouseEvent*>(event)->buttons() & Qt::LeftButton) {
        const QPoint to = static_cast<QMouseEvent*>(event)->globalPosition().toPoint() - dragFrom_;
        move(std::max(to.x(), 0), std::max(to.y(), 0));
        Q_EMIT moved();
        return true;
    }
    return false;
}

// --- the drawing --------------------------------------------------------------------------------------------

DiagramCanvas::DiagramCanvas(QueryDiagram& diagram, FieldLists& lists, QWidget* parent)
    : QWidget(parent)
    , diagram_(diagram)
    , lists_(lists)
{
    setAccessibleName(StringText(Str::DiagramName));
    setAutoFillBackground(true);
    setBackgroundRole(QPalette::Window);
}

DiagramBox* DiagramCanvas::BoxOf(const QString& source) const
{
    const auto found = std::ranges::find_if(boxes_, [&source](const DiagramBox* box) {
        return box->Table().Source().compare(source, Qt::CaseInsensitive) == 0;
    });
    return found == boxes_.end() ? nullptr : *found;
}

QPoint DiagramCanvas::FreePlace() const
{
    int right = spacing::kWide;
    for (const DiagramBox* box : boxes_)
        right = std::max(right, box->x() + kBoxWidth + kBetween);
    return {right, spacing::kWide};
}

DiagramBox* DiagramCanvas::MakeBox(const DiagramTable& table)
{
    const QPoint place = places_.value(table.Source(), FreePlace());
    auto* box = new DiagramBox(table, lists_.FieldsOf(table.table), this);
    box->adjustSize();
    box->move(place);
    places_.insert(table.Source(), place);
    box->show();
    const QString source = table.Source();
    connect(box, &DiagramBox::ticked, this, [this, source](const QString& field, bool shown) {
        diagram_.Show(source, field, shown);
        Q_EMIT changed();
    });
    connect(box, &DiagramBox::joined, this,
            [this, source](const QString& otherSource, const QString& otherField, const QString& field) {
                diagram_.AddJoin({otherSource, otherField, source, field});
                Q_EMIT changed();
            });
    connect(
        box, &DiagramBox::removeRequested, this,
        [this, source] {
            diagram_.RemoveTable(source);
            Q_EMIT changed();
        },
        Qt::QueuedConnection); // its box goes with it
    connect(box, &DiagramBox::joinMenuRequested, this,
            [this, source](const QString& field, const QPoint& at) { OfferJoins(source, field, at); });
    connect(box, &DiagramBox::moved, this, [this, box, source] {
        places_.insert(source, box->pos());
        FitToBoxes();
        ShowJoins();
    });
    connect(box, &DiagramBox::scrolled, this, &DiagramCanvas::ShowJoins);
    return box;
}

void DiagramCanvas::ShowDiagram()
{
    std::erase_if(boxes_, [this](DiagramBox* box) {
        const bool stays = std::ranges::find(diagram_.Tables(), box->Table()) != diagram_.Tables().end();
        if (!stays)
            box->deleteLater();
        if (!stays)
            box->hide();
        return !stays;
    });
    for (const DiagramTable& table : diagram_.Tables()) {
        if (!BoxOf(table.Source()))
            boxes_.push_back(MakeBox(table));
    }
    for (DiagramBox* box : boxes_)
        box->ShowTicks(diagram_);
    FitToBoxes();
    ShowJoins();
}

void DiagramCanvas::FitToBoxes()
{
    setMinimumSize(sizeHint());
    update();
}

QSize DiagramCanvas::sizeHint() const
{
    QRect all(0, 0, kBoxWidth, kBoxWidth / 2);
    for (const DiagramBox* box : boxes_)
        all = all.united(box->geometry());
    return {all.right() + spacing::kWide, all.bottom() + spacing::kWide};
}

// From the side of the left table that looks at the right one.
QPolygon DiagramCanvas::LineOfJoin(const DiagramJoin& join) const
{
    const DiagramBox* left = BoxOf(join.left);
    const DiagramBox* right = BoxOf(join.right);
    if (!left || !right)
        return {};
    const bool forward = left->geometry().center().x() <= right->geometry().center().x();
    const auto end = [](const DiagramBox* box, bool atRight, int y) {
        return QPoint(atRight ? box->geometry().right() + 1 : box->x(), y);
    };
    const QPoint from = end(left, forward, left->LineOf(join.leftField));
    const QPoint to = end(right, !forward, right->LineOf(join.rightField));
    const QPoint stub(forward ? kStub : -kStub, 0);
    return QPolygon({from, from + stub, to - stub, to});
}

void DiagramCanvas::ShowJoins()
{
    const std::vector<DiagramJoin>& joins = diagram_.Joins();
    while (joinButtons_.size() > joins.size()) {
        joinButtons_.back()->hide();
        joinButtons_.back()->deleteLater();
        joinButtons_.pop_back();
    }
    while (joinButtons_.size() < joins.size()) {
        auto* button = new QToolButton(this);
        const size_t join = joinButtons_.size();
        button->setPopupMode(QToolButton::InstantPopup);
        button->setFocusPolicy(Qt::StrongFocus);
        button->setMenu(new QMenu(button));
        button->setStyleSheet({});
        button->setFixedSize(kJoinButton, kJoinButton);
        connect(button->menu(), &QMenu::aboutToShow, this, [this, join] { FillJoinMenu(join); });
        joinButtons_.push_back(button);
        button->show();
    }
    for (size_t i = 0; i < joins.size(); ++i) {
        const DiagramJoin& join = joins[i];
        const QPolygon line = LineOfJoin(join);
        QToolButton* button = joinButtons_[i];
        button->setVisible(!line.isEmpty());
        if (line.isEmpty())
            continue;
        const bool forward = line.first().x() <= line.last().x();
        button->setText(!join.allOfLeft ? u"="_s : forward ? u"→"_s : u"←"_s);
        const QString text =
            StringText(Str::DiagramJoinText, {QueryDiagram::Reference(join.left, join.leftField),
                                              QueryDiagram::Reference(join.right, join.rightField)});
        button->setToolTip(text.toHtmlEscaped());
        button->setAccessibleName(text);
        button->move((line[1] + line[2]) / 2 - QPoint(kJoinButton, kJoinButton) / 2);
        button->raise();
    }
    update();
}

void DiagramCanvas::FillJoinMenu(size_t join)
{
    QMenu* menu = joinButtons_[join]->menu();
    menu->clear();
    if (join >= diagram_.Joins().size())
        return;
    const DiagramJoin shown = diagram_.Joins()[join];
    const auto add = [&](const QString& text, bool checked, auto change) {
        QAction* action = menu->addAction(text);
        action->setCheckable(true);
        action->setChecked(checked);
        connect(action, &QAction::triggered, this, [this, change] {
            change();
            Q_EMIT changed();
        });
    };
    const auto allOf = [](QString source) {
        return StringText(Str::DiagramJoinAll, {source.replace(u'&', u"&&"_s)});
    };
    add(StringText(Str::DiagramJoinMatching), !shown.allOfLeft, [this, join] { diagram_.SetJoin(join, false); });
    add(allOf(shown.left), shown.allOfLeft, [this, join] { diagram_.SetJoin(join, true); });
    add(allOf(shown.right), false, [this, join] {
        diagram_.TurnJoin(join);
        diagram_.SetJoin(join, true);
    });
    menu->addSeparator();
    QAction* remove = menu->addAction(StringText(Str::DiagramJoinRemove));
    connect(
        remove, &QAction::triggered, this,
        [this, join] {
            diagram_.RemoveJoin(join);
            Q_EMIT changed();
        },
        Qt::QueuedConnection);
}

// The same as a drag, for the keyboard and for a held finger.
void DiagramCanvas::OfferJoins(const QString& source, const QString& field, const QPoint& globalPosition)
{
    auto* menu = new QMenu(this);
    menu->setAttribute(Qt::WA_DeleteOnClose);
    for (const DiagramTable& table : diagram_.Tables()) {
        const QString other = table.Source();
        if (other == source)
            continue;
        QMenu* fields = menu->addMenu(StringText(Str::DiagramJoinTo, {QString(other).replace(u'&', u"&&"_s)}));
        for (const FieldLists::Field& target : lists_.FieldsOf(table.table)) {
            QAction* action = fields->addAction(QString(target.name).replace(u'&', u"&&"_s));
            connect(action, &QAction::triggered, this, [this, source, field, other, name = target.name] {
                diagram_.AddJoin({source, field, other, name});
                Q_EMIT changed();
            });
        }
    }
    if (menu->isEmpty())
        menu->addAction(StringText(Str::DiagramNoOtherTable))->setEnabled(false);
    menu->popup(globalPosition);
}

void DiagramCanvas::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(QPen(ColorOfRole(LookRole::Edge, palette()), 1.5));
    for (const DiagramJoin& join : diagram_.Joins())
        painter.drawPolyline(LineOfJoin(join));
    if (boxes_.empty()) {
        painter.setPen(palette().color(QPalette::PlaceholderText));
        const QRect room = rect().adjusted(spacing::kWide, spacing::kWide, -spacing::kWide, -spacing::kWide);
        painter.drawText(room, Qt::AlignCenter | Qt::TextWordWrap, StringText(Str::DiagramEmpty));
    }
}

void DiagramCanvas::resizeEvent(QResizeEvent* event)
{
    QWidget::resizeEvent(event);
    ShowJoins();
}

} // namespace mirel
