#include "Velm/PlatformUtilities.h"

#include <cstdlib>
#include <cstring>
#include <new>
#include <string>

#include "velmclient/CharacterConversion.h"
#include "velmclient/Configuration.h"

namespace Velm {

const char* PlatformUtilities::getSennetResourceFile() {
    return Configuration::instance().path(Configuration::Place::kSennetResources);
}

const char* PlatformUtilities::getSennetDirectory() {
    return Configuration::instance().path(Configuration::Place::kSennetDirectory);
}

const char* PlatformUtilities::getMIFOutputDirectory(const char* type) {
    return Configuration::instance().path(Configuration::Place::kMifDirectory, type);
}

const char* PlatformUtilities::getSQLOutputDirectory(const char* type) {
    return Configuration::instance().path(Configuration::Place::kSqlDirectory, type);
}

char PlatformUtilities::getSeparator() {
    return '/';
}

const char* PlatformUtilities::convertStringFromPlatform(const char* text) {
    if (text == nullptr) {
        return nullptr;
    }
    const std::string converted = toUtf8(text, localeCharset());
    char* result = ::strdup(converted.c_str());
    if (result == nullptr) {
        throw std::bad_alloc();
    }
    return result;
}

void PlatformUtilities::freeConvertedString(const char* text) {
    std::free(const_cast<char*>(text));
}

}  // namespace Velm
