#pragma once
/// A node of a fake DOM, which is also the list of its own attributes. It
/// counts the calls that fetch children and can be told to misbehave.
/// Releasing never frees it: the FakeXmlDom that made it does, so a test can
/// check that every reference handed out came back.
#include <string>
#include <vector>

#include "tov/ITOVXmlDom.h"

class FakeXmlNode : public UTIL::ITOVXmlDomElement, public UTIL::ITOVXmlDomAttribute, public UTIL::ITOVXmlDomNodeList {
public:
    FakeXmlNode(int32_t type, std::string name, std::string value);
    virtual ~FakeXmlNode() = default;

    /// Both return this node, for building a tree in one expression.
    FakeXmlNode* Add(FakeXmlNode* child);
    FakeXmlNode* With(FakeXmlNode* attribute);
    /// The node as the DOM hands it out.
    UTIL::ITOVXmlDomNode* Dom() { return static_cast<UTIL::ITOVXmlDomElement*>(this); }

    TOVRESULT QueryInterface(const _tovUID& iid, void** out) override;
    uint32_t AddRef() override { return ++refs; }
    uint32_t Release() override { return --refs; }
    int HasAttributes() override { return m_Attributes.empty() ? 0 : 1; }
    int32_t GetNodeType() override { return m_Type; }
    TOVRESULT GetName(ITOVString** out) override { return Text(m_Name, out); }
    TOVRESULT GetValue(ITOVString** out) override { return Text(m_Value, out); }
    uint32_t GetChildCount() override { return static_cast<uint32_t>(m_Children.size()); }
    TOVRESULT GetChild(uint32_t index, UTIL::ITOVXmlDomNode** out) override;
    TOVRESULT GetAttributes(UTIL::ITOVXmlDomNodeList** out) override;
    TOVRESULT GetTagName(ITOVString** out) override { return GetName(out); }
    TOVRESULT GetAttributeName(ITOVString** out) override { return GetName(out); }
    TOVRESULT GetAttributeValue(ITOVString** out) override { return GetValue(out); }
    uint32_t GetCount() override { return static_cast<uint32_t>(m_Attributes.size()); }
    TOVRESULT GetItem(uint32_t index, UTIL::ITOVXmlDomNode** out) override;

    uint32_t refs = 1;
    /// Calls of GetChild and GetAttributes.
    int fetches = 0;
    /// Faults: every QueryInterface fails with `queryResult`; the element and
    /// attribute views come back null with success; so do the attribute list,
    /// or every child.
    TOVRESULT queryResult = TOV_OK;
    bool nullView = false;
    bool nullAttributeList = false;
    bool nullChild = false;

private:
    static TOVRESULT Text(const std::string& text, ITOVString** out);
    static TOVRESULT HandOut(FakeXmlNode* node, UTIL::ITOVXmlDomNode** out);

    const int32_t m_Type;
    const std::string m_Name;
    const std::string m_Value;
    std::vector<FakeXmlNode*> m_Children;
    std::vector<FakeXmlNode*> m_Attributes;
};
