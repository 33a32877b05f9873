#pragma once
/// The one edge at which the library turns what was thrown into a result:
/// every interface operation runs its body through `Guarded`, so nothing
/// throws across the interface.
#include <new>
#include <utility>

#include "aaf/AAFResult.h"

namespace aafmodel {

/// Throws a failing result as an `int`; a success passes through.
inline AAFRESULT Check(AAFRESULT r) {
    if (AAFRESULT_FAILED(r)) throw static_cast<int>(r);
    return r;
}

/// Throws `result` when `p` is null.
template <class P>
inline void Require(const P& p, AAFRESULT result = AAFRESULT_NULL_PARAM) {
    if (!p) throw static_cast<int>(result);
}

template <class Body>
AAFRESULT Guarded(Body&& body) noexcept {
    try {
        return std::forward<Body>(body)();
    } catch (int r) {
        return r;
    } catch (const std::bad_alloc&) {
        return AAFRESULT_NOMEMORY;
    } catch (...) {
        return AAFRESULT_INTERNAL_ERROR;
    }
}

}  // namespace aafmodel
