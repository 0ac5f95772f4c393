#include "report/Json.h"

#include <ostream>

namespace sennetctl {

void printJson(const Json& document, const Output& output) {
    output.out << document.dump(2, ' ', false, Json::error_handler_t::replace) << '\n';
}

}  // namespace sennetctl
