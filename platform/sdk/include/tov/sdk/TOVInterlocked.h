#pragma once
/// Atomic add of plus or minus one with a full barrier; returns the new value.
inline int TOVInterlockedIncrement(int* value) { return __atomic_add_fetch(value, 1, __ATOMIC_SEQ_CST); }
inline int TOVInterlockedDecrement(int* value) { return __atomic_sub_fetch(value, 1, __ATOMIC_SEQ_CST); }
