#include "support/mif/Refusal.h"

#include "mifreader/Error.h"
#include "mifreader/MifReader.h"

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
