#pragma once
/// The attribute list a FakeXmlNode hands out; it frees itself at the last release.
#include <vector>

#include "FakeUnknown.h"
#include "FakeXmlNode.h"

class FakeXmlNodeList : public FakeUnknown<UTIL::ITOVXmlDomNodeList> {
public:
    explicit FakeXmlNodeList(std::vector<FakeXmlNode*> items) : m_Items(std::move(items)) {}

    uint32_t GetCount() override { return static_cast<uint32_t>(m_Items.size()); }
    TOVRESULT GetItem(uint32_t index, UTIL::ITOVXmlDomNode** out) override {
        *out = nullptr;
        if (index >= m_Items.size()) return TOV_E_OUTOFRANGE;
        *out = m_Items[index]->Dom();
        (*out)->AddRef();
        return TOV_OK;
    }

private:
    std::vector<FakeXmlNode*> m_Items;
};
