#include "SennetConverter/mif/TableRows.h"

#include <utility>

#include "SennetConverter/framework/CimInstanceLists.h"

namespace Pegasus {

namespace {

constexpr std::size_t kTextSize = std::size_t{64} * 1024;

}  // namespace

void TableRows::start(const CimInstanceLists& instanceLists, const SennetConverter& theAuthor) {
    author = &theAuthor;
    octets = 0;
    texts.clear();
    shown.clear();
    for (int i = 0; i < instanceLists.getNumberOfInstanceLists(); ++i) {
        shown.push_back(instanceLists.getInstanceList(i));
    }
}

void TableRows::add(std::string_view row) {
    octets += row.size();
    if (octets > kMostOctets) {
        shown.clear();
        texts.clear();
        return;
    }
    if (texts.empty() || texts.back().size() + row.size() > kTextSize) {
        texts.emplace_back().reserve(kTextSize);
    }
    texts.back() += row;
}

bool TableRows::show(const CimInstanceLists& instanceLists, const SennetConverter& reader) const {
    if (author == &reader || shown.empty() ||
        shown.size() != static_cast<std::size_t>(instanceLists.getNumberOfInstanceLists())) {
        return false;
    }
    for (std::size_t i = 0; i < shown.size(); ++i) {
        // The arrays kept here hold on to their elements, so these are nobody else's.
        const Array<CIMInstance> asked = instanceLists.getInstanceList(static_cast<int>(i));
        if (asked.getData() != shown[i].getData()) {
            return false;
        }
    }
    return true;
}

std::deque<std::string> TableRows::take() {
    shown.clear();
    return std::exchange(texts, {});
}

}  // namespace Pegasus
