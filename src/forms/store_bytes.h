#pragma once

#include "forms/form_store.h"

#include <QByteArray>

namespace mirel {

// The store file's bytes (docs/store-file.md). Reading never fails as a whole: it ends at the first record that
// is not whole, and `content` then holds the records before it. True when all the header promised was there.
bool ReadStore(QByteArrayView bytes, FormStore::Content& content);
QByteArray WriteStore(const FormStore::Content& content);

} // namespace mirel
