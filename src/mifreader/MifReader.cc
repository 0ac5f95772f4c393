#include "mifreader/MifReader.h"

#include "mifreader/Parser.h"

namespace Mif {

Component MifReader::read(std::string_view text) const {
    return Parser(text, tolerances).file();
}

}  // namespace Mif
