#pragma once
/// Identifiers that only this library answers: a query with one of them hands
/// back the library's own object behind an interface pointer, so that an
/// argument can be told to be ours (and a foreign one refused).
#include "aaf/AAFCOM.h"

namespace aafmodel {

inline constexpr aafUID_t kInternal_ModelObject = {
    0x4F524C4F, 0x00FF, 0x0001, {0x8F, 0x1C, 0x5A, 0x3E, 0x4F, 0x52, 0x4C, 0x4F}};
inline constexpr aafUID_t kInternal_ClassDefinition = {
    0x4F524C4F, 0x00FF, 0x0002, {0x8F, 0x1C, 0x5A, 0x3E, 0x4F, 0x52, 0x4C, 0x4F}};
inline constexpr aafUID_t kInternal_PropertyDefinition = {
    0x4F524C4F, 0x00FF, 0x0003, {0x8F, 0x1C, 0x5A, 0x3E, 0x4F, 0x52, 0x4C, 0x4F}};
inline constexpr aafUID_t kInternal_TypeDefinition = {
    0x4F524C4F, 0x00FF, 0x0004, {0x8F, 0x1C, 0x5A, 0x3E, 0x4F, 0x52, 0x4C, 0x4F}};
inline constexpr aafUID_t kInternal_DataDefinition = {
    0x4F524C4F, 0x00FF, 0x0005, {0x8F, 0x1C, 0x5A, 0x3E, 0x4F, 0x52, 0x4C, 0x4F}};
inline constexpr aafUID_t kInternal_PropertyValue = {
    0x4F524C4F, 0x00FF, 0x0006, {0x8F, 0x1C, 0x5A, 0x3E, 0x4F, 0x52, 0x4C, 0x4F}};

/// The library object of type `T` behind `p`, borrowed (no reference is
/// kept), or null when `p` is null or not one of ours.
template <class T>
T* Borrow(IUnknown* p, const aafUID_t& internalId) {
    void* out = nullptr;
    if (!p || AAFRESULT_FAILED(p->QueryInterface(internalId, &out)) || !out) return nullptr;
    T* object = static_cast<T*>(out);
    object->Release();  // the caller's own reference keeps it alive
    return object;
}

}  // namespace aafmodel
