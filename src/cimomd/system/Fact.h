#pragma once

// What a reader found: a value, or why there is none.

#include <cstdint>
#include <optional>
#include <type_traits>
#include <utility>

namespace cimomd {

/// Why a value is missing.
enum class Absence : std::uint8_t {
    /// The source does not exist or does not tell it.
    Absent,
    /// The source exists; this process may not read it.
    NeedsRoot,
    /// The source gives a text that only stands where a value should, or one that cannot be true.
    Filtered,
    /// The source did not answer in time.
    TimedOut,
    /// The source cannot be read or understood.
    Unreadable
};

/// Reads like std::optional; an empty one knows its reason.
template <typename T>
class Fact {
  public:
    Fact() = default;
    template <typename U = T>
    requires std::is_convertible_v<U, T> Fact(U known) : found(std::move(known)) {}
    Fact(std::optional<T> known) : found(std::move(known)) {}
    Fact(std::nullopt_t) {}
    Fact(Absence why) : missingReason(why) {}

    bool has_value() const { return found.has_value(); }
    explicit operator bool() const { return found.has_value(); }
    const T& operator*() const { return *found; }
    T& operator*() { return *found; }
    const T* operator->() const { return &*found; }
    /// Raises std::bad_optional_access when there is none.
    const T& value() const { return found.value(); }
    T value_or(T fallback) const { return found.value_or(std::move(fallback)); }
    operator const std::optional<T>&() const { return found; }

    /// Of a fact without a value.
    Absence reason() const { return missingReason; }

    /// `convert` of the value, which may give nothing for `otherwise`; the same reason without one.
    template <typename Convert>
    auto then(Convert convert, Absence otherwise = Absence::Filtered) const
        -> Fact<typename decltype(std::optional(convert(std::declval<const T&>())))::value_type> {
        if (!found)
            return missingReason;
        const std::optional converted(convert(*found));
        if (!converted)
            return otherwise;
        return *converted;
    }

    /// This, or the value of `other` when this has none. Without either the reason is this one's,
    /// but a source that tells nothing leaves it to the other.
    Fact orElse(const Fact& other) const {
        return !found && (other.found || missingReason == Absence::Absent) ? other : *this;
    }

    /// Two facts without a value are equal, whatever their reasons.
    friend bool operator==(const Fact& a, const Fact& b) { return a.found == b.found; }
    template <typename U>
    requires std::is_convertible_v<const U&, T>
    friend bool operator==(const Fact& a, const U& b) { return a.found == b; }
    friend bool operator==(const Fact& a, std::nullopt_t) { return !a.found; }

  private:
    std::optional<T> found;
    Absence missingReason = Absence::Absent;
};

}  // namespace cimomd
