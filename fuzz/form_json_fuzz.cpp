// Refusing is fine, with a reason; what was accepted can be kept in a store and read back.
#include "cli/form_json_reader.h"
#include "forms/form_store.h"

#include <cstdint>

using namespace mirel;

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    UserMessage fault{};
    const std::optional<FormDef> form =
        cli::ReadFormJson(QByteArray(reinterpret_cast<const char*>(data), qsizetype(size)), fault);
    if (!form) {
        if (fault.Text().isEmpty())
            __builtin_trap();
        return 0;
    }
    FormStore store;
    store.AddForm(*form);
    FormStore again;
    if (!again.LoadFrom(store.ToBytes()) || again.Forms().size() != 1 || !(again.Forms().front() == *form))
        __builtin_trap();
    return 0;
}
