#pragma once
/// A class of the object model: its parent, its own property definitions, and
/// the interface views that its instances answer besides IAAFObject.
#include <vector>

#include "MetaDefinitionBase.h"
#include "aaf/IAAFClassDef.h"

namespace aafmodel {

class PropertyDefinition;
class TypeDefinition;
struct ViewMaker;

class ClassDefinition final : public IAAFClassDef, public MetaDefinitionBase {
public:
    /// An undefined class, for CreateMetaInstance, has an empty name.
    ClassDefinition(Schema& schema, const aafUID_t& id, std::wstring name, ClassDefinition* parent, bool concrete);

    ClassDefinition* Parent() const { return m_parent; }
    bool Concrete() const { return m_concrete; }
    /// True when this class is `other` or derives from it.
    bool IsA(const ClassDefinition& other) const;
    /// This class's own property definitions, in the order they were added.
    const std::vector<PropertyDefinition*>& OwnProperties() const { return m_properties; }
    /// Finds a property of this class or of an ancestor, or null.
    PropertyDefinition* FindProperty(const aafUID_t& id) const;
    bool HasProperty(const PropertyDefinition& def) const;
    /// Adds a property definition; throws AAFRESULT_TABLE_DUP_KEY when the id is in use.
    PropertyDefinition* AddProperty(const aafUID_t& id, const std::wstring& name, TypeDefinition& type, bool optional);
    /// Takes back `def` when it is the property added last.
    void DropLastProperty(const PropertyDefinition& def) {
        if (!m_properties.empty() && m_properties.back() == &def) m_properties.pop_back();
    }
    /// Adds an interface view that instances of this class answer.
    void AddView(const ViewMaker& maker) { m_views.push_back(&maker); }
    const std::vector<const ViewMaker*>& Views() const { return m_views; }

    AAFRESULT QueryInterface(REFIID riid, void** ppvObj) override;
    aafUInt32 AddRef() override { return MetaDefinitionBase::AddRef(); }
    aafUInt32 Release() override { return MetaDefinitionBase::Release(); }

    using MetaDefinitionBase::Initialize;
    AAFRESULT Initialize(aafUID_constref classID, IAAFClassDef* pParentClass, aafCharacter_constptr pClassName,
                         aafBool isConcrete) override;
    AAFRESULT GetPropertyDefs(IEnumAAFPropertyDefs** ppEnum) override;
    AAFRESULT CountPropertyDefs(aafUInt32* pCount) override;
    AAFRESULT RegisterNewPropertyDef(aafUID_constref id, aafCharacter_constptr pName, IAAFTypeDef* pTypeDef,
                                     aafBool isOptional, aafBool isUniqueIdentifier,
                                     IAAFPropertyDef** ppPropDef) override;
    AAFRESULT RegisterOptionalPropertyDef(aafUID_constref id, aafCharacter_constptr pName, IAAFTypeDef* pTypeDef,
                                          IAAFPropertyDef** ppPropDef) override;
    AAFRESULT LookupPropertyDef(aafUID_constref propID, IAAFPropertyDef** ppPropDef) override;
    AAFRESULT GetName(aafCharacter* pName, aafUInt32 bufSize) override {
        return MetaDefinitionBase::GetName(pName, bufSize);
    }
    AAFRESULT GetNameBufLen(aafUInt32* pBufSize) override { return MetaDefinitionBase::GetNameBufLen(pBufSize); }
    AAFRESULT GetParent(IAAFClassDef** ppClassDef) override;
    AAFRESULT IsConcrete(aafBool* pResult) override;
    AAFRESULT IsRoot(aafBool* pIsRoot) override;
    AAFRESULT IsUniquelyIdentified(aafBool* pIsUniquelyIdentified) override;
    AAFRESULT GetUniqueIdentifier(IAAFPropertyDef** ppUniqueIdentifier) override;
    AAFRESULT CreateInstance(REFIID riid, IUnknown** ppvObject) override;

private:
    ClassDefinition* m_parent;
    bool m_concrete;
    std::vector<PropertyDefinition*> m_properties;
    std::vector<const ViewMaker*> m_views;
};

}  // namespace aafmodel
