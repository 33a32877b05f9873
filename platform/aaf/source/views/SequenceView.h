#pragma once
/// The components of a sequence.
#include "../core/ViewBase.h"
#include "aaf/IAAFSequence.h"

namespace aafmodel {

class SequenceView final : public View<IAAFSequence> {
public:
    using View::View;

    AAFRESULT Initialize(IAAFDataDef* pDataDef) override;
    AAFRESULT AppendComponent(IAAFComponent* pComponent) override;
    AAFRESULT PrependComponent(IAAFComponent* pComponent) override;
    AAFRESULT InsertComponentAt(aafUInt32 index, IAAFComponent* pComponent) override;
    AAFRESULT GetComponentAt(aafUInt32 index, IAAFComponent** ppComponent) override;
    AAFRESULT RemoveComponentAt(aafUInt32 index) override;
    AAFRESULT CountComponents(aafUInt32* pResult) override;
    AAFRESULT GetComponents(IEnumAAFComponents** ppEnum) override;
};

}  // namespace aafmodel
