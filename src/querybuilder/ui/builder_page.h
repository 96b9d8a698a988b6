#pragma once

#include "querybuilder/query_draft.h"
#include "querybuilder/ui/statement_edit.h"
#include "tableview/field_lists.h"

#include <QWidget>

#include <array>

namespace mirel {

// The "Builder" tab: a box for each clause of the draft. Draft and lists must outlive it.
class BuilderPage : public QWidget {
    Q_OBJECT
public:
    // What the lists beside it have chosen.
    struct Chosen {
        QString table;
        QString field;
    };

    BuilderPage(QueryDraft& draft, FieldLists& lists, std::function<Chosen()> chosen, QWidget* parent);

    void ShowClauses(); // of the draft, in all boxes
    void SetNarrow(bool narrow);
    // Into the box that has, or had last, the focus.
    void InsertTable(const QString& table);
    void InsertField(const QString& table, const QString& field);
    void FocusBox();

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    static constexpr size_t kClauses = 6;

    StatementEdit* BoxOf(QString QueryClauses::*clause) const;
    QWidget* Caption(size_t clause);
    void TakeChosen(size_t clause);
    void JoinTable(const QString& table);
    void TakeClauses();

    QueryDraft& draft_;
    FieldLists& lists_;
    std::function<Chosen()> chosen_;
    std::array<StatementEdit*, kClauses> boxes_{};
    std::array<QWidget*, kClauses> captions_{};
    size_t current_ = 0;
    bool showing_ = false;
};

} // namespace mirel
