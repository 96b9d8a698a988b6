#include "provider/provider.h"
#include "provider/sqlite/cedb_provider.h"

namespace mirel {

std::unique_ptr<ProviderConnection> CreateProvider(QStringView name)
{
    if (name == u"cedb")
        return std::make_unique<sqlite::CedbProvider>();
    return nullptr;
}

} // namespace mirel
