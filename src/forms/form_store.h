#pragma once

#include "forms/form_records.h"

#include <QByteArray>
#include <QDateTime>
#include <QString>

#include <functional>
#include <vector>

namespace mirel {

// All forms and saved queries of one database, and the file that holds them. An exported form is a store with
// that one form.
//
// The file is always written whole, and replaces the old one in one step: a crash costs the change, never the
// store. Several programs may have one store open; each change goes through Apply, so that none loses the
// other's. A value type: copies share nothing but the path.
class FormStore {
public:
    using Clock = std::function<QDateTime()>; // local time

    explicit FormStore(QString path = {}, Clock clock = &QDateTime::currentDateTime);

    const QString& Path() const { return path_; }

    // False, and the store as it was, only when the file cannot be opened. A file that breaks off gives what
    // was whole before the break.
    [[nodiscard]] bool Load();
    // Stamps the times and writes the file. On false file and store are as they were.
    [[nodiscard]] bool Save();
    // One change of the file by several programs: locks it, takes up what others wrote meanwhile, lets `change`
    // work on this store, saves, unlocks. `change` refuses by returning false. On false the file is as it was,
    // and so is the store but for the others' changes. References into the store are void afterwards.
    [[nodiscard]] bool Apply(const std::function<bool(FormStore& store)>& change);
    // Why Load, Save or Apply failed, in the system's words; empty when `change` refused.
    const QString& LastError() const { return lastError_; }

    // The same without a file. True when the bytes were whole; otherwise what was whole before the break is
    // there all the same.
    bool LoadFrom(QByteArrayView bytes);
    QByteArray ToBytes() const;

    std::vector<FormDef>& Forms() { return content_.forms; }
    const std::vector<FormDef>& Forms() const { return content_.forms; }
    std::vector<QueryDef>& Queries() { return content_.queries; }
    const std::vector<QueryDef>& Queries() const { return content_.queries; }

    void AddForm(FormDef form) { content_.forms.push_back(std::move(form)); }
    void AddQuery(QueryDef query) { content_.queries.push_back(std::move(query)); }
    // By exact name; null: none. Valid until the lists change.
    FormDef* FindForm(QStringView name);
    const FormDef* FindForm(QStringView name) const;
    QueryDef* FindQuery(QStringView name);
    const QueryDef* FindQuery(QStringView name) const;
    bool RemoveForm(QStringView name); // false: none of that name
    bool RemoveQuery(QStringView name);

    // Seconds of local time since 1970-01-01 00:00; 0 in a store that was never saved.
    quint32 Created() const { return content_.created; }
    quint32 Saved() const { return content_.saved; }

    // Whether both hold the same, header included; the path does not count.
    friend bool operator==(const FormStore& a, const FormStore& b) { return a.content_ == b.content_; }

    // What the file holds; the counts of its header are the sizes of the lists.
    struct Content {
        quint8 initialised = 0;
        std::array<quint8, 3> reserved{};
        quint32 created = 0;
        quint32 saved = 0;
        std::vector<FormDef> forms;
        std::vector<QueryDef> queries;

        friend bool operator==(const Content&, const Content&) = default;
    };

private:
    QString path_;
    Clock clock_;
    Content content_;
    QByteArray onDisk_; // the file as this store last read or wrote it
    QString lastError_;
};

} // namespace mirel
