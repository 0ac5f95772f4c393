// Reads any octets with the eyes of the administrator's program, as the first octet says: as a MIF
// file or an inventory script to check, as two MIF files to compare, which a NUL parts, or as a MIF
// file to show on a page. Every finding must name a place within the file, and what is made of a
// file must have a bound.

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <new>
#include <optional>
#include <string_view>
#include <vector>

#include "Require.h"
#include "html/InventoryPage.h"
#include "mif/MifDifference.h"
#include "mif/MifLint.h"
#include "mif/MifTables.h"
#include "report/CannotRun.h"
#include "script/ScriptLint.h"
#include "script/ScriptReader.h"

namespace {

std::size_t allocatedOctets = 0;  // since the program began, also of what is free again

void* allocated(std::size_t octets) noexcept {
    allocatedOctets += octets;
    return std::malloc(octets > 0 ? octets : 1);
}

}  // namespace

void* operator new(std::size_t octets) {
    if (void* memory = allocated(octets)) {
        return memory;
    }
    throw std::bad_alloc();
}

void* operator new(std::size_t octets, const std::nothrow_t&) noexcept {
    return allocated(octets);
}

void operator delete(void* memory) noexcept {
    std::free(memory);
}

void operator delete(void* memory, std::size_t) noexcept {
    std::free(memory);
}

namespace {

constexpr std::size_t kRoomOctets = std::size_t(1) << 16;

void requirePlaces(const std::vector<sennetctl::Finding>& findings, std::string_view text) {
    const auto lines = static_cast<std::size_t>(1 + std::count(text.begin(), text.end(), '\n'));
    for (const sennetctl::Finding& finding : findings) {
        require(finding.line <= lines && !finding.message.empty());
    }
}

void checkScript(std::string_view text) {
    std::vector<sennetctl::Finding> findings;
    sennetctl::ScriptModel model = sennetctl::ScriptReader("f.script.inv", findings).read(text);
    sennetctl::checkScript(model, findings);
    requirePlaces(findings, text);
}

// A thousand findings take a megabyte at most, and the rest grows with the file, so that rows that
// take texts from their group again and again stand out.
void checkMif(sennetctl::MifProfile profile, std::string_view text) {
    constexpr std::size_t kOctetsOfFindings = std::size_t(4) << 20;
    constexpr std::size_t kOctetsPerOctet = 512;
    sennetctl::LintOptions options;
    options.profile = profile;
    const std::size_t before = allocatedOctets;
    const std::vector<sennetctl::Finding> findings =
        sennetctl::MifLint(options).check("f.mif", text);
    require(allocatedOctets - before <= kOctetsOfFindings + kOctetsPerOctet * text.size());
    requirePlaces(findings, text);
}

std::optional<sennetctl::MifContent> contentOf(std::string_view text) {
    try {
        return sennetctl::mifContentOf("f.mif", text, kRoomOctets);
    } catch (const sennetctl::CannotRun& failure) {
        require(failure.failure().file == "f.mif" && !failure.failure().reason.empty());
        return std::nullopt;
    }
}

std::size_t octetsOf(const std::vector<sennetctl::MifChange>& changes) {
    std::size_t octets = 0;
    for (const sennetctl::MifChange& change : changes) {
        octets += change.table.size() + change.row.size() + change.attribute.size() +
                  change.before.size() + change.after.size();
    }
    return octets;
}

void compareMifs(std::string_view text) {
    const std::size_t end = std::min(text.find('\0'), text.size());
    const std::optional<sennetctl::MifContent> before = contentOf(text.substr(0, end));
    if (!before) {
        return;
    }
    require(sennetctl::differencesOf(*before, *before, kRoomOctets).empty());
    const std::optional<sennetctl::MifContent> after =
        contentOf(text.substr(std::min(end + 1, text.size())));
    if (!after) {
        return;
    }
    try {
        require(octetsOf(sennetctl::differencesOf(*before, *after, kRoomOctets)) <= kRoomOctets);
    } catch (const sennetctl::CannotRun& failure) {
        require(failure.failure().reason == "the differences are larger than 0 MiB");
    }
}

// A value takes less markup than it takes room, an octet of a definition at most four forms of six
// octets, and each table, of 60 octets at least, tells the component, of six octets each.
void showMif(std::string_view text) {
    const std::optional<sennetctl::MifContent> content = contentOf(text);
    if (!content) {
        return;
    }
    sennetctl::InventoryPage page("page");
    const std::size_t frame = page.text().size();
    page.add("f.mif", 0, *content);
    const std::size_t size = text.size();
    require(page.text().size() <= frame + 1024 + 4 * kRoomOctets + 64 * size + size * size / 10);
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    if (size == 0) {
        return 0;
    }
    const unsigned kind = data[0] & 7U;
    const std::string_view text(reinterpret_cast<const char*>(data) + 1, size - 1);
    if (kind < 4) {
        checkMif(static_cast<sennetctl::MifProfile>(kind), text);
    } else if (kind < 6) {
        checkScript(text);
    } else if (kind == 6) {
        compareMifs(text);
    } else {
        showMif(text);
    }
    return 0;
}
