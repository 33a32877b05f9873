#pragma once
/// Exact fractions for the image geometry. Products and quotients are worked
/// out in 64 bits and reduced; a result that does not fit in T throws
/// std::overflow_error and a division by zero std::domain_error, so a caller
/// that guards its body turns either into its own failure.
#include <cstdint>
#include <limits>
#include <numeric>
#include <stdexcept>

namespace RationalHelper {

template <class T>
class Rational {
public:
    constexpr Rational() = default;
    constexpr Rational(T numerator, T denominator) : m_numerator(numerator), m_denominator(denominator) {}

    constexpr T Numerator() const { return m_numerator; }
    constexpr T Denominator() const { return m_denominator; }

    /// Lowest terms, the sign on the numerator. With a zero denominator the
    /// value is no number and stays as it is; a sign that cannot move
    /// (the lowest value of T over -1) stays where it is.
    Rational Reduced() const {
        if (m_denominator == 0) return *this;
        std::int64_t n = m_numerator, d = m_denominator;
        const std::int64_t divisor = std::gcd(n, d);
        n /= divisor;
        d /= divisor;
        if (d < 0 && Fits(-n)) {
            n = -n;
            d = -d;
        }
        return Rational(static_cast<T>(n), static_cast<T>(d));
    }

    Rational operator*(const Rational& o) const {
        return Make(std::int64_t{m_numerator} * o.m_numerator, std::int64_t{m_denominator} * o.m_denominator);
    }
    Rational operator/(const Rational& o) const {
        return Make(std::int64_t{m_numerator} * o.m_denominator, std::int64_t{m_denominator} * o.m_numerator);
    }
    Rational operator-(const Rational& o) const {
        return Make(std::int64_t{m_numerator} * o.m_denominator - std::int64_t{o.m_numerator} * m_denominator,
                    std::int64_t{m_denominator} * o.m_denominator);
    }
    /// Equal terms, as stored: compare reduced values for equal numbers.
    constexpr bool operator==(const Rational& o) const {
        return m_numerator == o.m_numerator && m_denominator == o.m_denominator;
    }

private:
    static constexpr bool Fits(std::int64_t v) {
        return v >= std::numeric_limits<T>::min() && v <= std::numeric_limits<T>::max();
    }
    // Products and differences of 32-bit terms stay inside 64 bits.
    static Rational Make(std::int64_t n, std::int64_t d) {
        if (d == 0) throw std::domain_error("division by zero");
        const std::int64_t divisor = std::gcd(n, d);
        n /= divisor;
        d /= divisor;
        if (d < 0) {
            n = -n;
            d = -d;
        }
        if (!Fits(n) || !Fits(d)) throw std::overflow_error("rational out of range");
        return Rational(static_cast<T>(n), static_cast<T>(d));
    }

    T m_numerator = 0;
    T m_denominator = 1;
};

}  // namespace RationalHelper
