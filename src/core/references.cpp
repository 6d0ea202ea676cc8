#include "core/references.h"

namespace kindrel::core {

std::span<const Reference> references()
{
    return {};
}

}
