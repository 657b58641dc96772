// libFuzzer target: the catalog data file reader.

#include "fuzz/catalog_reader_property.h"

#include <cstddef>
#include <cstdint>

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    fuzzing::CheckCatalogBytes(std::string_view(reinterpret_cast<const char*>(data), size));
    return 0;
}
