#pragma once

#include <QDialog>
#include <QSet>
#include <QTextBrowser>
#include <QUrl>

class QAction;
class QLineEdit;
class QListWidget;

namespace mirel {

// The text of the help: pictures no wider than the view, the functions of expressions from their own table.
class HelpBrowser : public QTextBrowser {
    Q_OBJECT
public:
    explicit HelpBrowser(QWidget* parent);

    static QString PagePath(); // of Mirel.htm in the language that is spoken, or in English
    void GoTo(const QString& topic);

protected:
    QVariant loadResource(int type, const QUrl& name) override;
    void resizeEvent(QResizeEvent* event) override;

private:
    QVariant Picture(const QUrl& name) const;
    void FitPictures();

    QSet<QUrl> pictures_;
    int widthPx_ = 0; // that the pictures were fitted to
};

// The help: Mirel.htm#topic, with its pages beside it where there is room, back and forward, and a line that finds
// a text in all pages. It does not block the window that it belongs to.
class CHelpWindow : public QDialog {
    Q_OBJECT
public:
    explicit CHelpWindow(QWidget* parent);

    void GoTo(const QString& topic);

protected:
    void resizeEvent(QResizeEvent* event) override;

private:
    void MakeBar();
    void FillPages();
    void ShowPlace();
    void Find(QTextDocument::FindFlags flags);
    void FindAgain(bool backward);

    HelpBrowser* text_;
    QListWidget* pages_;
    QLineEdit* search_;
    QAction* back_ = nullptr;
    QAction* forward_ = nullptr;
    QWidget* bar_;
};

// Opens the help over `window`, or turns it to that topic where it is open.
void ShowHelp(QWidget& window, const QString& topic);
// Of the view or dialog that holds the widget; an unknown one belongs to whatever is around it.
QString HelpTopicOf(const QWidget& part);

} // namespace mirel
