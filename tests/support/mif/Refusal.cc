#include "support/mif/Refusal.h"

#include "support/mif/Error.h"
#include "support/mif/MifReader.h"

namespace Mif {

std::string refusal(std::string_view text, Tolerances tolerances) {
    try {
        MifReader(tolerances).read(text);
    } catch (const Error& error) {
        return error.what();
    }
    return "accepted";
}

}  // namespace Mif
