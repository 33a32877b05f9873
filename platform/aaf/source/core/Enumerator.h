#pragma once
/// The enumerators of the interface (IEnumAAFMobs and its kin): a snapshot of
/// counted references taken when the enumerator is made.
#include <vector>

#include "Guard.h"
#include "RefPtr.h"
#include "aaf/AAF.h"

namespace aafmodel {

template <class IEnum, class Item>
class Enumerator final : public IEnum {
public:
    explicit Enumerator(std::vector<RefPtr<Item>> items, size_t position = 0)
        : m_items(std::move(items)), m_position(position) {}

    AAFRESULT QueryInterface(REFIID riid, void** ppvObj) override {
        if (!ppvObj) return AAFRESULT_NULL_PARAM;
        if (riid != IID_IUnknown && riid != AAFInterfaceID<IEnum>::value) {
            *ppvObj = nullptr;
            return AAF_E_NOINTERFACE;
        }
        *ppvObj = static_cast<IEnum*>(this);
        AddRef();
        return AAFRESULT_SUCCESS;
    }
    aafUInt32 AddRef() override { return ++m_refs; }
    aafUInt32 Release() override {
        const aafUInt32 left = --m_refs;
        if (left == 0) delete this;
        return left;
    }

    AAFRESULT NextOne(Item** ppItem) override {
        if (!ppItem) return AAFRESULT_NULL_PARAM;
        if (m_position >= m_items.size()) return AAFRESULT_NO_MORE_OBJECTS;
        *ppItem = m_items[m_position++].get();
        (*ppItem)->AddRef();
        return AAFRESULT_SUCCESS;
    }
    AAFRESULT Next(aafUInt32 count, Item** ppItems, aafUInt32* pFetched) override {
        if (!ppItems || (count > 1 && !pFetched)) return AAFRESULT_NULL_PARAM;
        aafUInt32 fetched = 0;
        while (fetched < count && AAFRESULT_SUCCEEDED(NextOne(&ppItems[fetched]))) ++fetched;
        if (pFetched) *pFetched = fetched;
        return fetched == count ? AAFRESULT_SUCCESS : AAFRESULT_NO_MORE_OBJECTS;
    }
    AAFRESULT Skip(aafUInt32 count) override {
        if (count > m_items.size() - m_position) return AAFRESULT_NO_MORE_OBJECTS;
        m_position += count;
        return AAFRESULT_SUCCESS;
    }
    AAFRESULT Reset() override {
        m_position = 0;
        return AAFRESULT_SUCCESS;
    }
    AAFRESULT Clone(IEnum** ppEnum) override {
        return Guarded([&] {
            Require(ppEnum);
            *ppEnum = new Enumerator(m_items, m_position);
            (*ppEnum)->AddRef();
            return AAFRESULT_SUCCESS;
        });
    }

private:
    aafUInt32 m_refs = 0;
    std::vector<RefPtr<Item>> m_items;
    size_t m_position;
};

}  // namespace aafmodel
