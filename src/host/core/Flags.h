// A small set of bit flags over an unsigned integer, addressed by bit number.
#pragma once

#include <type_traits>

namespace orvcore::utility {

// Bit flags stored in a T; bit n is the value 1 << n. Bits beyond the width of T are ignored.
template <typename T> class Flags {
    static_assert(std::is_unsigned<T>::value, "Flags need an unsigned integer type");

public:
    constexpr Flags() = default;
    constexpr explicit Flags(T value)
        : value_(value) {}

    constexpr bool IsSet(unsigned bit) const { return bit < Width && (value_ & Mask(bit)) != 0; }
    constexpr void Set(unsigned bit, bool on = true) {
        if (bit >= Width) {
            return;
        }
        value_ = on ? T(value_ | Mask(bit)) : T(value_ & T(~Mask(bit)));
    }
    constexpr void Clear(unsigned bit) { Set(bit, false); }
    constexpr T Get() const { return value_; }
    constexpr bool Any() const { return value_ != 0; }

    constexpr bool operator==(Flags const& o) const { return value_ == o.value_; }
    constexpr bool operator!=(Flags const& o) const { return value_ != o.value_; }

private:
    static constexpr unsigned Width = sizeof(T) * 8;
    static constexpr T Mask(unsigned bit) { return T(T(1) << bit); }
    T value_ = 0;
};

} // namespace orvcore::utility
