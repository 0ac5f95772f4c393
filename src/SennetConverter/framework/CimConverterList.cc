#include "SennetConverter/framework/CimConverterList.h"

#include <memory>

#include "SennetConverter/framework/CimConverter.h"

namespace Pegasus {

CimConverterList::~CimConverterList() {
    clearAndDelete();
}

void CimConverterList::addConverter(CimConverter* converter) {
    std::unique_ptr<CimConverter> owned(converter);
    converters.push_back(converter);
    static_cast<void>(owned.release());
}

int CimConverterList::getNumberOfConverters() const {
    return static_cast<int>(converters.size());
}

CimConverter* CimConverterList::getConverter(int index) const {
    if (index < 0 || index >= getNumberOfConverters()) {
        return nullptr;
    }
    return converters[static_cast<std::size_t>(index)];
}

void CimConverterList::clear() {
    converters.clear();
}

void CimConverterList::clearAndDelete() {
    for (CimConverter* converter : converters) {
        delete converter;
    }
    converters.clear();
}

}  // namespace Pegasus
