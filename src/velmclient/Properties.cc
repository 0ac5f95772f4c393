#include "Velm/Properties.h"

#include <string_view>
#include <utility>

namespace Velm {

const char* Properties::getPropertyValue(const char* key) const {
    if (key == nullptr || values == nullptr) {
        return nullptr;
    }
    const auto found = values->find(std::string_view(key));
    return found != values->end() ? found->second.c_str() : nullptr;
}

void Properties::set(std::string key, std::string value) {
    if (values == nullptr) {
        values = std::make_shared<Values>();
    } else if (values.use_count() > 1) {
        values = std::make_shared<Values>(*values);
    }
    values->insert_or_assign(std::move(key), std::move(value));
}

}  // namespace Velm
