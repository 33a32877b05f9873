#pragma once
/// One present property of an object, as IEnumAAFProperties hands it out:
/// its definition and a value that shares the object's storage.
#include <memory>

#include "RefPtr.h"
#include "Value.h"
#include "aaf/IAAFProperty.h"

namespace aafmodel {

class PropertyDefinition;

class Property final : public IAAFProperty {
public:
    Property(PropertyDefinition& def, std::shared_ptr<Value> value);

    AAFRESULT QueryInterface(REFIID riid, void** ppvObj) override;
    aafUInt32 AddRef() override { return ++m_refs; }
    aafUInt32 Release() override;

    AAFRESULT GetDefinition(IAAFPropertyDef** ppPropDef) override;
    AAFRESULT GetValue(IAAFPropertyValue** ppValue) override;

private:
    ~Property();

    aafUInt32 m_refs = 0;
    PropertyDefinition& m_def;  // kept alive by the reference below
    std::shared_ptr<Value> m_value;
};

}  // namespace aafmodel
