#include "help/ui/help_window.h"

#include "expr/function_library.h"
#include "help/help_topics.h"
#include "platform/ui/look_roles.h"
#include "platform/ui/window_place.h"
#include "resources/language.h"
#include "resources/string_table.h"
#include "resources/ui/theme_icon.h"

#include <QAction>
#include <QApplication>
#include <QBoxLayout>
#include <QFile>
#include <QImage>
#include <QLineEdit>
#include <QListWidget>
#include <QRegularExpression>
#include <QScreen>
#include <QScrollBar>
#include <QSplitter>
#include <QTextBlock>
#include <QToolButton>

// A resource in a static library is linked only when it is asked for; the macro wants the global namespace.
static void LinkTexts()
{
    Q_INIT_RESOURCE(help);
}

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr int kPagesFrom = 560; // logical pixels of width, from which the list of pages stands beside the text
constexpr QSize kFirstSize(760, 620);
const QString kPage = u"Mirel.htm"_s;

QString Read(const QString& path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? QString::fromUtf8(file.readAll()) : QString();
}

// The rows of the library, so that the page cannot lack one.
QString FunctionRows()
{
    QString rows;
    for (const FunctionDef& function : Functions()) {
        const QString help = StringText(function.help);
        const qsizetype colon = help.indexOf(u':');
        rows += u"<p><b>%1</b>%2</p>"_s.arg(help.left(colon).toHtmlEscaped(), help.mid(colon).toHtmlEscaped());
    }
    return rows;
}

QString StyleSheet(const QPalette& palette)
{
    return u"h1, h2 { color: %1; } h1 { font-size: x-large; } h2 { font-size: large; margin-top: 28px; } p, li { "
           u"margin-bottom: 6px; } a { color: %2; } "
           "td { padding: 2px 6px 2px 0; } .dim { color: %3; }"_s.arg(
               ColorOfRole(LookRole::Text, palette).name(), ColorOfRole(LookRole::Accent, palette).name(),
               ColorOfRole(LookRole::Dim, palette).name());
}

} // namespace

HelpBrowser::HelpBrowser(QWidget* parent)
    : QTextBrowser(parent)
{
    document()->setDefaultStyleSheet(StyleSheet(palette()));
    document()->setDocumentMargin(spacing::kGap);
    setAccessibleName(StringText(Str::HelpText));
}

QString HelpBrowser::PagePath()
{
    LinkTexts();
    const LanguageTexts* spoken = SpokenLanguage();
    const QString own = u":/help/%1/%2"_s.arg(spoken ? spoken->Code().section(u'_', 0, 0) : u"en"_s, kPage);
    return QFile::exists(own) ? own : u":/help/en/"_s + kPage;
}

void HelpBrowser::GoTo(const QString& topic)
{
    QUrl url(u"qrc"_s + PagePath());
    url.setFragment(topic);
    setSource(url);
}

QVariant HelpBrowser::loadResource(int type, const QUrl& name)
{
    const QUrl whole = source().resolved(name);
    if (whole.scheme() != u"qrc") // nothing from elsewhere
        return {};
    if (type == QTextDocument::HtmlResource)
        return Read(u':' + whole.path()).replace(u"<!--functions-->"_s, FunctionRows());
    if (type != QTextDocument::ImageResource)
        return {};
    pictures_ += whole;
    return Picture(whole);
}

QVariant HelpBrowser::Picture(const QUrl& name) const
{
    const QImage picture(u':' + name.path());
    const int room = std::max(viewport()->width() - 2 * int(document()->documentMargin()) - 2, 1);
    return picture.width() <= room ? picture : picture.scaledToWidth(room, Qt::SmoothTransformation);
}

void HelpBrowser::resizeEvent(QResizeEvent* event)
{
    QTextBrowser::resizeEvent(event);
    if (std::exchange(widthPx_, viewport()->width()) != viewport()->width())
        FitPictures();
}

void HelpBrowser::FitPictures()
{
    for (const QUrl& picture : std::as_const(pictures_))
        document()->addResource(QTextDocument::ImageResource, picture, Picture(picture));
    document()->markContentsDirty(0, document()->characterCount());
}

CHelpWindow::CHelpWindow(QWidget* parent)
    : QDialog(parent)
    , bar_(new QWidget(this))
{
    setWindowTitle(StringText(Str::HelpTitle));
    setAttribute(Qt::WA_DeleteOnClose);
    auto* parts = new QSplitter(this);
    pages_ = new QListWidget(parts);
    pages_->setAccessibleName(StringText(Str::HelpPages));
    pages_->setTextElideMode(Qt::ElideRight);
    pages_->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    text_ = new HelpBrowser(parts);
    parts->setChildrenCollapsible(false);
    parts->setStretchFactor(1, 1);
    parts->setSizes({220, 540});
    search_ = new QLineEdit(bar_);
    MakeBar();
    auto* lines = new QVBoxLayout(this);
    lines->setContentsMargins({});
    lines->setSpacing(0);
    lines->addWidget(bar_);
    lines->addWidget(parts, 1);
    resize(kFirstSize.boundedTo(screen()->availableSize()));
    FillPages();
    connect(text_, &QTextBrowser::sourceChanged, this, &CHelpWindow::ShowPlace);
    connect(text_, &QTextBrowser::historyChanged, this, &CHelpWindow::ShowPlace);
    connect(pages_, &QListWidget::itemClicked, this,
            [this](const QListWidgetItem* item) { GoTo(item->data(Qt::UserRole).toString()); });
    connect(pages_, &QListWidget::itemActivated, this,
            [this](const QListWidgetItem* item) { GoTo(item->data(Qt::UserRole).toString()); });
    text_->setFocus();
}

void CHelpWindow::MakeBar()
{
    auto* row = new QHBoxLayout(bar_);
    row->setContentsMargins(spacing::kTight, spacing::kTight, spacing::kTight, spacing::kTight);
    row->setSpacing(spacing::kTight);
    // Actions, because a button waits a moment before it obeys its key.
    const auto command = [this, row](Str name, Str tip, const char16_t* icon, QKeySequence key) {
        auto* action = new QAction(ThemeIcon(icon), StringText(name), this);
        action->setShortcut(key);
        action->setToolTip(
            StringText(Str::TipWithKeys, {StringText(tip), key.toString(QKeySequence::NativeText)}));
        addAction(action);
        auto* button = new QToolButton(bar_);
        button->setDefaultAction(action);
        button->setAutoRaise(true);
        button->setFocusPolicy(Qt::TabFocus);
        button->setAccessibleName(StringText(name).remove(u'&'));
        row->addWidget(button);
        return action;
    };
    connect(
        command(Str::HelpContents, Str::HelpContentsTip, u"help-contents", QKeySequence(Qt::ALT | Qt::Key_Home)),
        &QAction::triggered, this, [this] { GoTo(u"contents"_s); });
    back_ = command(Str::HelpBack, Str::HelpBackTip, u"go-previous", QKeySequence(Qt::ALT | Qt::Key_Left));
    connect(back_, &QAction::triggered, text_, &QTextBrowser::backward);
    forward_ = command(Str::HelpForward, Str::HelpForwardTip, u"go-next", QKeySequence(Qt::ALT | Qt::Key_Right));
    connect(forward_, &QAction::triggered, text_, &QTextBrowser::forward);
    search_->setPlaceholderText(StringText(Str::FindPrompt));
    search_->setAccessibleName(StringText(Str::HelpFind));
    search_->setClearButtonEnabled(true);
    search_->setMinimumWidth(1);
    row->addWidget(search_, 1);
    connect(
        command(Str::ActionFindPrevious, Str::HelpFindPreviousTip, u"go-up", QKeySequence(Qt::SHIFT | Qt::Key_F3)),
        &QAction::triggered, this, [this] { FindAgain(true); });
    connect(command(Str::ActionFindNext, Str::HelpFindNextTip, u"go-down", QKeySequence(Qt::Key_F3)),
            &QAction::triggered, this, [this] { FindAgain(false); });
    connect(command(Str::ActionClose, Str::ActionCloseTip, u"window-close", QKeySequence(Qt::CTRL | Qt::Key_W)),
            &QAction::triggered, this, &QDialog::close);
    connect(search_, &QLineEdit::textEdited, this, [this] {
        QTextCursor from = text_->textCursor();
        from.setPosition(from.selectionStart()); // a longer text is looked for from the same place
        text_->setTextCursor(from);
        Find({});
    });
    auto* next = new QAction(search_);
    next->setShortcuts({QKeySequence(Qt::Key_Return), QKeySequence(Qt::Key_Enter)});
    next->setShortcutContext(Qt::WidgetShortcut);
    search_->addAction(next);
    connect(next, &QAction::triggered, this, [this] { FindAgain(false); });
    auto* find = new QAction(this);
    find->setShortcut(QKeySequence(Qt::CTRL | Qt::Key_F));
    addAction(find);
    connect(find, &QAction::triggered, search_, [this] {
        search_->setFocus();
        search_->selectAll();
    });
}

void CHelpWindow::FillPages()
{
    static const QRegularExpression heading(uR"x(<h2><a name="(\w+)"></a>([^<]+)</h2>)x"_s);
    auto found = heading.globalMatch(Read(HelpBrowser::PagePath()));
    while (found.hasNext()) {
        const QRegularExpressionMatch match = found.next();
        auto* item = new QListWidgetItem(match.captured(2), pages_);
        item->setData(Qt::UserRole, match.captured(1));
        item->setToolTip(match.captured(2));
    }
}

void CHelpWindow::GoTo(const QString& topic)
{
    text_->GoTo(topic);
}

void CHelpWindow::ShowPlace()
{
    back_->setEnabled(text_->isBackwardAvailable());
    forward_->setEnabled(text_->isForwardAvailable());
    for (int row = 0; row < pages_->count(); ++row) {
        if (pages_->item(row)->data(Qt::UserRole) == text_->source().fragment())
            pages_->setCurrentRow(row);
    }
}

// On from the selection; from the other end where nothing is left.
void CHelpWindow::Find(QTextDocument::FindFlags flags)
{
    const QString wanted = search_->text();
    const QTextCursor before = text_->textCursor();
    bool found = wanted.isEmpty() || text_->find(wanted, flags);
    if (!found) {
        text_->moveCursor(flags & QTextDocument::FindBackward ? QTextCursor::End : QTextCursor::Start);
        found = text_->find(wanted, flags);
    }
    if (!found)
        text_->setTextCursor(before);
    search_->setProperty(kRefusedProperty, !found);
    search_->setToolTip(found ? QString() : StringText(Str::FindNothing));
    search_->update();
}

void CHelpWindow::FindAgain(bool backward)
{
    Find(backward ? QTextDocument::FindBackward : QTextDocument::FindFlags());
}

void CHelpWindow::resizeEvent(QResizeEvent* event)
{
    QDialog::resizeEvent(event);
    pages_->setVisible(width() >= kPagesFrom);
}

void ShowHelp(QWidget& window, const QString& topic)
{
    QWidget* over = window.window();
    auto* help = qobject_cast<CHelpWindow*>(over);
    if (!help)
        help = over->findChild<CHelpWindow*>(QString(), Qt::FindDirectChildrenOnly);
    if (!help) {
        help = new CHelpWindow(over);
        FillSmallWindow(*help, *over);
        help->show();
    }
    help->GoTo(topic);
    help->raise();
    help->activateWindow();
}

QString HelpTopicOf(const QWidget& part)
{
    for (const QWidget* each = &part; each; each = each->parentWidget()) {
        const QString name = QString::fromLatin1(each->metaObject()->className()).section(u"::"_s, -1);
        const QString topic = HelpTopicOfClass(name);
        if (!topic.isEmpty())
            return topic;
    }
    return u"main"_s;
}

} // namespace mirel
