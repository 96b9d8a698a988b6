// What windows cost, on the offscreen platform:
//
// mirel-bench-window bare PICTURE         a window with a menu, painted into a PNG file: what Qt itself takes
// mirel-bench-window grid PICTURE ROWS    the same with a QTableView over so many rows
// mirel-bench-window page DATABASE        turning pages of the table Birds, against a QTableView in turns; prints
//                                         a line as mirel-bench-engine does
// mirel-bench-window drag                 dragging controls in the form maker
// mirel-bench-window import DATABASE CSV  the import wizard from its file to the last step, into a new table; says
//                                         what the last step took and how often the window was repainted meanwhile
#include "app/ui/message_box_prompt.h"
#include "csvimport/ui/import_wizard.h"
#include "forms/ui/design_surface.h"
#include "forms/ui/form_mak_view.h"
#include "tableview/record_browser.h"
#include "tableview/ui/record_grid.h"

#include <QAbstractTableModel>
#include <QApplication>
#include <QElapsedTimer>
#include <QHeaderView>
#include <QImage>
#include <QLabel>
#include <QMainWindow>
#include <QMenuBar>
#include <QMessageBox>
#include <QMouseEvent>
#include <QPushButton>
#include <QScrollBar>
#include <QStackedWidget>
#include <QTableView>
#include <QTimer>

#include <algorithm>
#include <cmath>
#include <cstdio>
#include <ctime>

using namespace mirel;
using namespace Qt::StringLiterals;

namespace {

constexpr QSize kWindowSize(1100, 700);
constexpr int kRows = 30;
constexpr int kColumns = 10;

[[noreturn]] void Fail(const QString& what)
{
    std::fprintf(stderr, "%s\n", what.toUtf8().constData());
    std::exit(1);
}

// As many rows as asked for, without holding them.
class NumberModel : public QAbstractTableModel {
public:
    explicit NumberModel(int rows)
        : rows_(rows)
    {
    }
    int rowCount(const QModelIndex&) const override { return rows_; }
    int columnCount(const QModelIndex&) const override { return kColumns; }
    QVariant data(const QModelIndex& index, int role) const override
    {
        return role == Qt::DisplayRole ? QVariant(u"%1, column %2"_s.arg(index.row()).arg(index.column()))
                                       : QVariant();
    }

private:
    int rows_;
};

// The texts of a table's first records, in memory: what a view has to show without having to read it.
class TextModel : public QAbstractTableModel {
public:
    explicit TextModel(RecordBrowser& browser)
    {
        browser.SetRowsPerPage(kRows * 20);
        browser.GoToFirst();
        page_ = browser.Page();
    }
    int rowCount(const QModelIndex&) const override { return page_.RowCount(); }
    int columnCount(const QModelIndex&) const override { return page_.ColumnCount(); }
    QVariant data(const QModelIndex& index, int role) const override
    {
        return role == Qt::DisplayRole ? QVariant(page_.At(index.row(), index.column()).text) : QVariant();
    }

private:
    RecordPage page_;
};

int Paint(QWidget* content, const QString& picture)
{
    QMainWindow window;
    QMenu* menu = window.menuBar()->addMenu(u"File"_s);
    for (const QString& entry : {u"Open"_s, u"Close"_s, u"Quit"_s})
        menu->addAction(entry);
    window.setCentralWidget(content);
    window.resize(kWindowSize);
    window.show();
    QCoreApplication::processEvents();
    return window.grab().save(picture, "PNG") ? 0 : 1;
}

double ProcessorMs()
{
    timespec now{};
    clock_gettime(CLOCK_PROCESS_CPUTIME_ID, &now);
    return double(now.tv_sec) * 1e3 + double(now.tv_nsec) / 1e6;
}

class SilentPrompt : public UserPrompt {
public:
    bool AskYesNo(const UserMessage&) override { return false; }
    void Show(const UserMessage& message) override { Fail(message.Text()); }
    void ShowError(const QString& text) override { Fail(text); }
    std::optional<QString> AskText(const UserMessage&, const UserMessage&, const QString&) override { return {}; }
    std::unique_ptr<Progress> StartProgress(const UserMessage&, qint64) override { return {}; }
};

int TurnPages(const QString& database)
{
    DbConnection connection;
    SilentPrompt prompt;
    RecordBrowser browser(connection, database, prompt, {});
    if (!browser.Open(RecordBrowser::StatementOfTable(u"Birds")))
        return 1;
    TextModel model(browser);
    QTableView table;
    table.setModel(&model);
    browser.SetRowsPerPage(kRows);
    RecordGrid grid(browser, nullptr);
    grid.ShowState();
    const int rowHeight = grid.CellRect(0, 0).height();
    grid.resize(kWindowSize.width(), (kRows + 2) * rowHeight);
    table.verticalHeader()->setDefaultSectionSize(rowHeight);
    table.resize(grid.size());
    for (QWidget* widget : {static_cast<QWidget*>(&grid), static_cast<QWidget*>(&table)}) {
        widget->setAttribute(Qt::WA_DontShowOnScreen);
        widget->show();
    }
    QImage image(grid.size(), QImage::Format_RGB32);
    double best = HUGE_VAL;
    double theirBest = HUGE_VAL;
    constexpr int kPages = 200;
    browser.GoToFirst();
    for (int page = 0; page < kPages; ++page) {
        double begin = ProcessorMs();
        browser.PageDown();
        grid.ShowState();
        grid.render(&image);
        best = std::min(best, ProcessorMs() - begin);

        begin = ProcessorMs();
        table.verticalScrollBar()->setValue(page % 19 * kRows);
        table.resizeColumnsToContents();
        table.render(&image);
        theirBest = std::min(theirBest, ProcessorMs() - begin);
    }
    std::printf("turn a page of %d x %d cells, columns fitted\t%.4f\t%.4f\t%.4f\t%.4f\t-\t3.5 ms; QTableView\n",
                kRows, model.columnCount({}), best, theirBest, best, theirBest);
    return 0;
}

// One move event of a drag with its repaint, for one control of 300 and for all of them.
int DragControls()
{
    FormDef form;
    form.SetName(u"Drag");
    form.width = 620;
    form.height = 640;
    for (int i = 0; i < 300; ++i) {
        ControlDef control;
        control.type = ControlTypes()[size_t(i) % ControlTypes().size()].type;
        control.windowStyle = TypeOf(control.type).windowStyle;
        control.name.Set(u"Control %1"_s.arg(i));
        control.left = i % 10 * 60 + 5;
        control.top = i / 10 * 20 + 5;
        control.width = 55;
        control.height = 18;
        form.AddControl(control);
    }
    DbConnection connection;
    SilentPrompt prompt;
    FormStore store;
    CFormMakView view(form, FormMaker::Start::Stored,
                      {.maker = {connection, {}, store, prompt}, .dialogs = {}, .words = {}});
    view.resize(kWindowSize);
    view.show();
    DesignSurface& surface = view.Surface();
    for (const bool all : {false, true}) {
        if (all)
            view.Maker().Design().SelectAll();
        else
            view.Maker().Design().SelectOnly(155);
        surface.ShowState();
        QCoreApplication::processEvents();
        QPointF at = surface.RectOf(155).center();
        const auto send = [&](QEvent::Type type, Qt::MouseButton button) {
            QMouseEvent event(type, at, surface.mapToGlobal(at), button, Qt::LeftButton, {});
            QCoreApplication::sendEvent(&surface, &event);
            QCoreApplication::processEvents();
        };
        send(QEvent::MouseButtonPress, Qt::LeftButton);
        constexpr int kMoves = 200;
        double sum = 0;
        double worst = 0;
        for (int move = 0; move < kMoves; ++move) {
            at += move % 2 ? QPointF(-11, 14) : QPointF(13, -12);
            const double begin = ProcessorMs();
            send(QEvent::MouseMove, Qt::NoButton);
            const double took = ProcessorMs() - begin;
            sum += took;
            worst = std::max(worst, took);
        }
        send(QEvent::MouseButtonRelease, Qt::LeftButton);
        std::printf("drag %s of 300 controls, a move event with its repaint\t%.3f ms\tworst %.3f ms\n",
                    all ? "all" : "one", sum / kMoves, worst);
    }
    view.GiveUpEdits();
    return 0;
}

// Counts how often any window is repainted, and the longest time without that.
class Repaints : public QObject {
public:
    void Begin()
    {
        count_ = 0;
        longestMs_ = 0;
        since_.start();
    }
    int Count() const { return count_; }
    qint64 LongestMs() const { return std::max(longestMs_, since_.elapsed()); }

protected:
    bool eventFilter(QObject* watched, QEvent* event) override
    {
        if (event->type() == QEvent::UpdateRequest && watched->isWidgetType()) {
            ++count_;
            longestMs_ = std::max(longestMs_, since_.restart());
        }
        return QObject::eventFilter(watched, event);
    }

private:
    int count_ = 0;
    qint64 longestMs_ = 0;
    QElapsedTimer since_;
};

int ImportByWizard(const QString& database, const QString& csv)
{
    DbConnection connection;
    MessageBoxPrompt prompt;
    ImportDraft draft(connection, database, prompt);
    QWidget window;
    window.resize(kWindowSize);
    window.show();
    CImportWizard wizard(draft, prompt, csv, &window);
    wizard.show();
    wizard.Begin(ImportSource::OfFile(csv));
    QTimer answers; // "imported."
    QObject::connect(&answers, &QTimer::timeout, &answers, [] {
        if (auto* box = qobject_cast<QMessageBox*>(QApplication::activeModalWidget()))
            box->accept();
    });
    answers.start(1);
    const auto goOn = [&wizard] {
        for (auto* button : wizard.findChildren<QPushButton*>()) {
            if (button->isDefault())
                button->click();
        }
    };
    const auto* pages = wizard.findChild<QStackedWidget*>();
    while (pages->currentIndex() + 1 < pages->count())
        goOn();
    Repaints repaints;
    qApp->installEventFilter(&repaints);
    QElapsedTimer clock;
    clock.start();
    repaints.Begin();
    const double begin = ProcessorMs();
    while (wizard.isVisible())
        goOn();
    const double seconds = double(clock.elapsed()) / 1e3;
    std::fprintf(stderr,
                 "last step: %.0f ms of processor time, %.2f s by the clock, %.1f repaints a second, %lld ms at "
                 "the most between two\n",
                 ProcessorMs() - begin, seconds, repaints.Count() / seconds, (long long)repaints.LongestMs());
    return 0;
}

} // namespace

int main(int argc, char** argv)
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    const QApplication application(argc, argv);
    const QStringList words = QApplication::arguments();
    const QString what = words.value(1);
    if (what == u"bare")
        return Paint(new QLabel(u"A window"_s), words.value(2));
    if (what == u"grid") {
        NumberModel model(words.value(3).toInt());
        auto* table = new QTableView;
        table->setModel(&model);
        return Paint(table, words.value(2));
    }
    if (what == u"page")
        return TurnPages(words.value(2));
    if (what == u"import")
        return ImportByWizard(words.value(2), words.value(3));
    if (what == u"drag")
        return DragControls();
    Fail(u"mirel-bench-window bare|grid|page|drag|import …"_s);
}
