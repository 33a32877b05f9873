#pragma once
/// Small conveniences for driving the host's XML components in tests.
#include <gtest/gtest.h>

#include <string>

#include "tov/ITOVXmlDom.h"
#include "tov/ITOVXmlParser.h"
#include "tov/host/HostText.h"
#include "tov/host/TOVHost.h"
#include "tov/sdk/TOVPtr.h"

inline TOVPtr<ITOVString> Str(const std::string& utf8) {
    TOVPtr<ITOVString> s;
    if (HostText::Make(utf8, s.OutT()) < 0) throw static_cast<int>(TOV_E_FAIL);
    return s;
}

inline std::string Utf8(ITOVString* s) { return HostText::Read(s); }

inline TOVPtr<UTIL::ITOVXmlParser> NewDomReader(TOVHost* host) {
    TOVPtr<UTIL::ITOVXmlParser> parser;
    EXPECT_EQ(host->CreateComponent(UTIL::CompID_TOVXmlReader, nullptr, UTIL::IID_ITOVXmlParser, parser.Out()), TOV_OK);
    return parser;
}

/// The root element `parser` read, or an empty pointer.
inline TOVPtr<UTIL::ITOVXmlDomNode> RootOf(UTIL::ITOVXmlParser* parser) {
    TOVPtr<ITOVUnknown> root;
    TOVPtr<UTIL::ITOVXmlDomNode> node;
    if (parser->GetRoot(root.OutT()) == TOV_OK) root->QueryInterface(UTIL::IID_ITOVXmlDomNode, node.Out());
    return node;
}

/// Why the last parse of a DOM or SAX reader failed.
template <class Parser>
std::string LastError(Parser* parser) {
    TOVPtr<ITOVString> error;
    EXPECT_EQ(parser->GetLastError(error.OutT()), TOV_OK);
    return Utf8(error.Get());
}

inline std::string NameOf(const TOVPtr<UTIL::ITOVXmlDomNode>& node) {
    TOVPtr<ITOVString> s;
    EXPECT_EQ(node->GetName(s.OutT()), TOV_OK);
    return Utf8(s.Get());
}

inline std::string ValueOf(const TOVPtr<UTIL::ITOVXmlDomNode>& node) {
    TOVPtr<ITOVString> s;
    EXPECT_EQ(node->GetValue(s.OutT()), TOV_OK);
    return Utf8(s.Get());
}

inline TOVPtr<UTIL::ITOVXmlDomNode> ChildOf(const TOVPtr<UTIL::ITOVXmlDomNode>& node, uint32_t index) {
    TOVPtr<UTIL::ITOVXmlDomNode> child;
    EXPECT_EQ(node->GetChild(index, child.OutT()), TOV_OK);
    return child;
}
