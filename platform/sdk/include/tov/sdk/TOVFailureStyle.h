#pragma once
/// The failure style of every public slot: inside, failures are thrown as a
/// plain `int` result; at the slot, `TOVGuarded` turns what was thrown into
/// a result, so that no exception ever leaves it.
#include <utility>

#include "tov/TOVResult.h"

/// Throws a negative result as an `int`; returns a success unchanged.
inline TOVRESULT TOVCheck(TOVRESULT result) {
    if (result < 0) throw static_cast<int>(result);
    return result;
}

/// Runs `body` (returning a TOVRESULT). A thrown `int` comes back as that
/// value, anything else thrown as TOV_E_UNEXPECTED.
template <class Body>
TOVRESULT TOVGuarded(Body&& body) noexcept {
    try {
        return std::forward<Body>(body)();
    } catch (int result) {
        return result;
    } catch (...) {
        return TOV_E_UNEXPECTED;
    }
}
