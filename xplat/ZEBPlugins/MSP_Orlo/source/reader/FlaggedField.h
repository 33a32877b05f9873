#pragma once
/// A value with a has flag, for records whose values may be absent: the flag
/// decides, not the value.
///
/// ORLO_FLAGGED_FIELD(Prefix, Type, Name) declares the member m_<Name> and the
/// public accessors Get<Prefix><Name>, Set<Prefix><Name>, Has<Prefix><Name> and
/// SetHas<Prefix><Name>; Prefix may be empty. The class keeps the flags in one
/// member `m_Has` with a bool per Name, so that they clear together. Leaves
/// the class in its private part.
#define ORLO_FLAGGED_FIELD(Prefix, Type, Name)                      \
public:                                                             \
    const Type& Get##Prefix##Name() const { return m_##Name; }      \
    void Set##Prefix##Name(const Type& value) { m_##Name = value; } \
    bool Has##Prefix##Name() const { return m_Has.Name; }           \
    void SetHas##Prefix##Name(bool has) { m_Has.Name = has; }       \
                                                                    \
private:                                                            \
    Type m_##Name{};
