#include "ViewSupport.h"

#include <chrono>
#include <cstring>
#include <ctime>
#include <random>

#include "../core/ClassDefinition.h"
#include "../core/DataDefinition.h"
#include "../core/InternalIDs.h"
#include "../core/Schema.h"
#include "../core/WideText.h"

namespace aafmodel {

const BuiltinDefinitions& Builtins(const ModelObject& object) { return object.GetSchema().B(); }

aafTimeStamp_t Now() {
    using namespace std::chrono;
    const auto now = system_clock::now();
    const std::time_t seconds = system_clock::to_time_t(now);
    const auto hundredths = duration_cast<milliseconds>(now.time_since_epoch()).count() % 1000 / 10;
    std::tm utc{};
    gmtime_r(&seconds, &utc);
    aafTimeStamp_t stamp{};
    stamp.date.year = static_cast<aafInt16>(utc.tm_year + 1900);
    stamp.date.month = static_cast<aafUInt8>(utc.tm_mon + 1);
    stamp.date.day = static_cast<aafUInt8>(utc.tm_mday);
    stamp.time.hour = static_cast<aafUInt8>(utc.tm_hour);
    stamp.time.minute = static_cast<aafUInt8>(utc.tm_min);
    stamp.time.second = static_cast<aafUInt8>(utc.tm_sec);
    stamp.time.fraction = static_cast<aafUInt8>(hundredths);
    return stamp;
}

DataDefinition& DataDefArg(IAAFDataDef* pDataDef) {
    DataDefinition* def = Borrow<DataDefinition>(pDataDef, kInternal_DataDefinition);
    Require(def);
    return *def;
}

ModelObject& ObjectArg(IUnknown* pObject, const ClassDefinition& cls) {
    ModelObject* object = ModelObject::From(pObject);
    Require(object);
    if (!object->Class().IsA(cls)) throw static_cast<int>(AAFRESULT_INVALID_OBJ);
    return *object;
}

RefPtr<ModelObject> NewObject(ClassDefinition& cls) {
    RefPtr<ModelObject> object(new ModelObject(cls));
    object->MarkInitialized();
    return object;
}

void CopyStringProperty(const ModelObject& object, const PropertyDefinition& def, aafCharacter* buffer,
                        aafUInt32 bufSize) {
    std::wstring text;
    if (!object.GetString(def, text)) throw static_cast<int>(AAFRESULT_PROP_NOT_PRESENT);
    CopyWide(text, buffer, bufSize);
}

aafUInt32 StringPropertyBufLen(const ModelObject& object, const PropertyDefinition& def) {
    std::wstring text;
    if (!object.GetString(def, text)) throw static_cast<int>(AAFRESULT_PROP_NOT_PRESENT);
    return WideBufLen(text);
}

void InitializeMob(ModelObject& mob) {
    mob.MarkInitialized();
    const BuiltinDefinitions& b = Builtins(mob);
    // A UMID label for a Mob ID of material made by this library, with a
    // random material number.
    static std::mt19937_64 random{std::random_device{}()};
    aafMobID_t id{{0x06, 0x0A, 0x2B, 0x34, 0x01, 0x01, 0x01, 0x01, 0x01, 0x01, 0x0F, 0x00}, 0x13, 0, 0, 0, {}};
    const aafUInt64 a = random(), c = random();
    std::memcpy(&id.material, &a, 8);
    std::memcpy(reinterpret_cast<aafUInt8*>(&id.material) + 8, &c, 8);
    mob.SetFixed(*b.p.mobMobID, id);
    const aafTimeStamp_t now = Now();
    mob.SetFixed(*b.p.mobLastModified, now);
    mob.SetFixed(*b.p.mobCreationTime, now);
    mob.Ensure(*b.p.mobSlots);
}

void SetDataDefinition(ModelObject& component, const DataDefinition& def) {
    component.SetFixed(*Builtins(component).p.componentDataDefinition, def.Id());
}

DataDefinition& GetDataDefinition(const ModelObject& component) {
    const auto id = component.GetRequired<aafUID_t>(*Builtins(component).p.componentDataDefinition);
    DataDefinition* def = component.GetSchema().FindDataDef(id);
    Require(def, AAFRESULT_INVALID_DATADEF);
    return *def;
}

}  // namespace aafmodel
