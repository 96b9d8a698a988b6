#pragma once

#include "app/renaming.h"

#include <QList>

#include <functional>

namespace mirel {

class CFormEngView;
class CTableView;

// The open views while a table is changed in its structure: they write what is pending before, and run again or
// close afterwards. A renaming offers to mend what refers to the name.
//
// All arguments must outlive it.
class OpenViews : public MendingHost {
public:
    struct Lists {
        std::function<QList<CTableView*>()> tables;
        std::function<QList<CFormEngView*>()> forms;
    };

    OpenViews(DatabaseSession& session, Lists lists)
        : MendingHost(session)
        , lists_(std::move(lists))
    {
    }

    bool WritePending(const QString& table) override;
    void TableChanged(const QString& table) override;
    void TableDropped(const QString& table) override;
    bool Rename(const NameChange& change,
                const std::function<bool(const DesignRun::LastStep& last)>& rename) override;

private:
    QList<CTableView*> TablesOn(const QString& table) const;
    QList<CFormEngView*> FormsOn(const QString& table) const;

    Lists lists_;
    std::optional<NameChange> renamed_; // and not yet taken up by the views
};

} // namespace mirel
