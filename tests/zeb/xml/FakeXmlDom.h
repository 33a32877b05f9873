#pragma once
/// Makes and owns the nodes of one fake DOM, and sums what was done to them.
#include <memory>
#include <string>
#include <vector>

#include "FakeXmlNode.h"

class FakeXmlDom {
public:
    FakeXmlNode* Element(const std::string& tag) { return Make(UTIL::kTOVXmlElement, tag, ""); }
    FakeXmlNode* Attribute(const std::string& name, const std::string& value) {
        return Make(UTIL::kTOVXmlAttribute, name, value);
    }
    FakeXmlNode* Text(const std::string& text) { return Make(UTIL::kTOVXmlText, "#text", text); }
    /// CDATA, comments, processing instructions and the like.
    FakeXmlNode* Node(int32_t type, const std::string& value) { return Make(type, "#node", value); }

    /// Calls that fetched children or attributes, over all nodes.
    int Fetches() const {
        int fetches = 0;
        for (const auto& node : m_Nodes) fetches += node->fetches;
        return fetches;
    }
    /// References handed out and not given back, over all nodes.
    int Outstanding() const {
        int outstanding = 0;
        for (const auto& node : m_Nodes) outstanding += static_cast<int>(node->refs) - 1;
        return outstanding;
    }

private:
    FakeXmlNode* Make(int32_t type, const std::string& name, const std::string& value) {
        m_Nodes.push_back(std::make_unique<FakeXmlNode>(type, name, value));
        return m_Nodes.back().get();
    }

    std::vector<std::unique_ptr<FakeXmlNode>> m_Nodes;
};
