#pragma once

#include "forms/form_records.h"

#include <QString>

namespace mirel {

// What a form is started with.
struct FormCall {
    FormDef form;
    QString query;      // its first result; empty: the form's own
    qint64 record = -1; // the record shown first, from 0; -1: the first one
};

// What a running form asks of the program around it.
class FormHost {
public:
    virtual ~FormHost() = default;

    // CALL FORM: runs another form, or the same one a second time, in a running form of its own.
    virtual void CallForm(const FormCall& call) = 0;
    // The form is done. Comes from within one of its calls: destroy it later.
    virtual void CloseForm() = 0;
    // The form changed data of the database; comes when it is closed or calls another form.
    virtual void DataChanged() = 0;

    // The query that a SELECT button ran last, in whichever form.
    QString lastQuery;
};

} // namespace mirel
