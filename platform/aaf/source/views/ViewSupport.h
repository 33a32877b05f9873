#pragma once
/// Small helpers that the views share: arguments checked and turned into the
/// library's own objects, new objects, strings in and out, the clock.
#include "../core/BuiltinDefinitions.h"
#include "../core/ClassDefinition.h"
#include "../core/DataDefinition.h"
#include "../core/Guard.h"
#include "../core/ModelObject.h"
#include "../core/RefPtr.h"
#include "../core/Schema.h"
#include "aaf/AAF.h"

namespace aafmodel {

class ClassDefinition;
class DataDefinition;
class PropertyDefinition;
struct BuiltinDefinitions;

/// The built-in definitions of the object's schema.
const BuiltinDefinitions& Builtins(const ModelObject& object);
/// The current time in UTC, to the hundredth of a second.
aafTimeStamp_t Now();
/// A caller's data definition; throws AAFRESULT_NULL_PARAM for null or foreign ones.
DataDefinition& DataDefArg(IAAFDataDef* pDataDef);
/// A caller's object, which must be of `cls`; throws AAFRESULT_NULL_PARAM for
/// null or foreign ones and AAFRESULT_INVALID_OBJ for one of another class.
ModelObject& ObjectArg(IUnknown* pObject, const ClassDefinition& cls);
/// A new object of `cls`, already initialised.
RefPtr<ModelObject> NewObject(ClassDefinition& cls);
/// Queries `object` for the interface of `*out`.
template <class I>
AAFRESULT HandOut(ModelObject& object, I** out) {
    Require(out);
    return object.QueryInterface(AAFInterfaceID<I>::value, reinterpret_cast<void**>(out));
}
/// Sets a fixed-size built-in property of `object`.
template <class T>
AAFRESULT SetBuiltin(ModelObject& object, PropertyDefinition* BuiltinDefinitions::Properties::*prop, const T& v) {
    return Guarded([&] {
        object.SetFixed(*(Builtins(object).p.*prop), v);
        return AAFRESULT_SUCCESS;
    });
}
/// Reads a fixed-size built-in property of `object`; AAFRESULT_PROP_NOT_PRESENT when absent.
template <class T>
AAFRESULT GetBuiltin(ModelObject& object, PropertyDefinition* BuiltinDefinitions::Properties::*prop, T* out) {
    return Guarded([&] {
        Require(out);
        *out = object.GetRequired<T>(*(Builtins(object).p.*prop));
        return AAFRESULT_SUCCESS;
    });
}
/// Copies a string property into a caller's buffer; AAFRESULT_PROP_NOT_PRESENT when absent.
void CopyStringProperty(const ModelObject& object, const PropertyDefinition& def, aafCharacter* buffer,
                        aafUInt32 bufSize);
/// The buffer size of a string property; AAFRESULT_PROP_NOT_PRESENT when absent.
aafUInt32 StringPropertyBufLen(const ModelObject& object, const PropertyDefinition& def);
/// Makes a new Mob usable: a fresh Mob ID, creation and modification times
/// of now, and an empty list of slots; the second time throws AAFRESULT_ALREADY_INITIALIZED.
void InitializeMob(ModelObject& mob);
/// Sets a component's data definition.
void SetDataDefinition(ModelObject& component, const DataDefinition& def);
/// A component's data definition; AAFRESULT_PROP_NOT_PRESENT when it has none.
DataDefinition& GetDataDefinition(const ModelObject& component);

}  // namespace aafmodel
