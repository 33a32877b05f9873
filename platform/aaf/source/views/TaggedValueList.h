#pragma once
/// The comments and attributes of Mobs and components: vectors of tagged
/// values whose values are strings.
#include "../core/ModelObject.h"
#include "aaf/AAFForward.h"

namespace aafmodel {

class PropertyDefinition;

/// Appends a tagged value named `name` holding the string `value`.
void AppendTaggedString(ModelObject& owner, const PropertyDefinition& list, aafCharacter_constptr name,
                        aafCharacter_constptr value);
aafUInt32 CountTagged(const ModelObject& owner, const PropertyDefinition& list);
/// An enumerator over the list; an absent list gives an empty one.
IEnumAAFTaggedValues* EnumerateTagged(const ModelObject& owner, const PropertyDefinition& list);
/// Removes one tagged value; AAFRESULT_OBJECT_NOT_FOUND when it is not in the list.
void RemoveTagged(ModelObject& owner, const PropertyDefinition& list, IAAFTaggedValue* pValue);

}  // namespace aafmodel
