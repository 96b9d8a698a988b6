// Refusing is fine; what was accepted, whole or up to a break, must survive being written and be safe to use.
#include "forms/form_store.h"

#include <cstdint>

using mirel::FormDef;
using mirel::FormStore;

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    const QByteArrayView bytes(data, qsizetype(size));
    FormStore store;
    const bool whole = store.LoadFrom(bytes);
    const QByteArray written = store.ToBytes();
    FormStore again;
    if (!again.LoadFrom(written) && size >= 20)
        __builtin_trap();
    if (!(again == store) || again.ToBytes() != written)
        __builtin_trap();
    if (whole && written.size() > bytes.size())
        __builtin_trap();
    for (const FormDef& form : store.Forms()) {
        FormDef copy;
        copy.CopyFrom(form);
        if (copy.controls != form.controls || copy.defaultQuery.Text() != form.defaultQuery.Text())
            __builtin_trap();
    }
    return 0;
}
