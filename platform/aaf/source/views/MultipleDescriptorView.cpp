#include "MultipleDescriptorView.h"

#include "../core/Enumerator.h"
#include "../core/Schema.h"
#include "ViewSupport.h"
#include "aaf/IAAFFileDescriptor.h"
#include "aaf/IEnumAAFFileDescriptors.h"

namespace aafmodel {

AAFRESULT MultipleDescriptorView::Initialize() {
    return Guarded([&] {
        m_object.MarkInitialized();
        m_object.Ensure(*Builtins(m_object).p.multipleFileDescriptors);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT MultipleDescriptorView::CountFileDescriptors(aafUInt32* pResult) {
    if (!pResult) return AAFRESULT_NULL_PARAM;
    const auto* items = m_object.FindVector(*Builtins(m_object).p.multipleFileDescriptors);
    *pResult = items ? static_cast<aafUInt32>(items->size()) : 0;
    return AAFRESULT_SUCCESS;
}

AAFRESULT MultipleDescriptorView::AppendFileDescriptor(IAAFFileDescriptor* pFileDescriptor) {
    aafUInt32 count = 0;
    CountFileDescriptors(&count);
    return InsertFileDescriptorAt(count, pFileDescriptor);
}

AAFRESULT MultipleDescriptorView::PrependFileDescriptor(IAAFFileDescriptor* pFileDescriptor) {
    return InsertFileDescriptorAt(0, pFileDescriptor);
}

AAFRESULT MultipleDescriptorView::InsertFileDescriptorAt(aafUInt32 index, IAAFFileDescriptor* pFileDescriptor) {
    return Guarded([&] {
        const BuiltinDefinitions& b = Builtins(m_object);
        m_object.InsertInto(*b.p.multipleFileDescriptors, index, ObjectArg(pFileDescriptor, *b.c.fileDescriptor));
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT MultipleDescriptorView::GetFileDescriptorAt(aafUInt32 index, IAAFFileDescriptor** ppFileDescriptor) {
    return Guarded([&] {
        const auto* items = m_object.FindVector(*Builtins(m_object).p.multipleFileDescriptors);
        if (!items || index >= items->size()) throw static_cast<int>(AAFRESULT_BADINDEX);
        return HandOut(*(*items)[index], ppFileDescriptor);
    });
}

AAFRESULT MultipleDescriptorView::RemoveFileDescriptorAt(aafUInt32 index) {
    return Guarded([&] {
        m_object.RemoveFrom(*Builtins(m_object).p.multipleFileDescriptors, index);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT MultipleDescriptorView::GetFileDescriptors(IEnumAAFFileDescriptors** ppEnum) {
    return Guarded([&] {
        Require(ppEnum);
        std::vector<RefPtr<IAAFFileDescriptor>> items;
        if (const auto* descriptors = m_object.FindVector(*Builtins(m_object).p.multipleFileDescriptors))
            for (const auto& d : *descriptors) items.push_back(d->Query<IAAFFileDescriptor>());
        *ppEnum = new Enumerator<IEnumAAFFileDescriptors, IAAFFileDescriptor>(std::move(items));
        (*ppEnum)->AddRef();
        return AAFRESULT_SUCCESS;
    });
}

}  // namespace aafmodel
