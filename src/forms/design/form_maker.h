#pragma once

#include "data/db_connection.h"
#include "forms/design/form_design.h"
#include "forms/form_store.h"
#include "platform/user_prompt.h"

#include <QString>

#include <functional>
#include <optional>
#include <vector>

namespace mirel {

// What a form maker works with. All of it must outlive the maker.
struct MakerSurroundings {
    DbConnection& connection;
    DatabaseLocation database;
    FormStore& store;
    UserPrompt& prompt;
};

// The form maker without its window: a design, the form of the store that it is for, and the commands that ask
// before they replace, delete or save.
//
// Nothing of the store changes but by Save and SaveAs. When those fail, or the user says No, the design stays as
// it is and modified, and the store as it was.
class FormMaker {
public:
    enum class Start {
        Stored, // a form of the store
        New,    // not saved yet, and without a name of its own: Save asks for one
    };
    FormMaker(FormDef form, Start start, MakerSurroundings surroundings);
    Q_DISABLE_COPY_MOVE(FormMaker)

    FormDesign& Design() { return design_; }
    const FormDesign& Design() const { return design_; }
    const MakerSurroundings& Surroundings() const { return surroundings_; }
    // The name under which the store has it; empty: not saved yet.
    const QString& StoredName() const { return storedName_; }

    // --- the form's table ---------------------------------------------------------------------------------

    // The fields of the form's table as they are now; empty when it cannot be read.
    const std::vector<ResultField>& Fields();
    QStringList Tables();
    void ForgetFields() { fields_.reset(); } // the table's structure may have changed

    // --- commands: true when done; false when the user stopped it or was told why not ----------------------

    bool Save();
    bool SaveAs();
    // "Save changes?" where there are any. True: the form may close.
    bool MayClose();
    bool DeleteSelected();
    bool DeleteAll();
    bool CreateDefaultForm();
    bool LayOutAllFields();
    bool MayImport(); // asks where there are controls
    bool Import(const QString& path);
    bool Export(const QString& path); // an existing file is replaced after a question

    // What of the form will show nothing; asked about before it is saved, once each. Set by who can tell.
    std::function<QStringList(const FormDef& form)> losses;

private:
    bool SaveUnder(const QString& name);
    bool AcceptsLosses();
    bool Tell(Str message, const QStringList& arguments = {});
    bool MayReplace(Str question);

    FormDesign design_;
    MakerSurroundings surroundings_;
    QString storedName_;
    FormDef stored_; // as this maker last read or wrote it
    std::optional<std::vector<ResultField>> fields_;
    QString fieldsTable_;
    QStringList acceptedLosses_;
};

} // namespace mirel
