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

/// A new component `compId` of `host`, asked for `iid`.
template <class I>
TOVPtr<I> NewComponent(TOVHost* host, const _tovUID& compId, const _tovUID& iid) {
    TOVPtr<I> made;
    EXPECT_EQ(host->CreateComponent(compId, nullptr, iid, made.Out()), TOV_OK);
    return made;
}

inline TOVPtr<UTIL::ITOVXmlParser> NewDomReader(TOVHost* host) {
    return NewComponent<UTIL::ITOVXmlParser>(host, UTIL::CompID_TOVXmlReader, UTIL::IID_ITOVXmlParser);
}

/// The root element `parser` read, or an empty pointer.
inline TOVPtr<UTIL::ITOVXmlDomNode> RootOf(UTIL::ITOVXmlParser* parser) {
    TOVPtr<ITOVUnknown> root;
    TOVPtr<UTIL::ITOVXmlDomNode> node;
    if (parser->GetRoot(root.OutT()) == TOV_OK) root->QueryInterface(UTIL::IID_ITOVXmlDomNode, node.Out());
    return node;
}

/// The text that `get` of `object` hands out.
template <class Object>
std::string TextOf(Object* object, TOVRESULT (Object::*get)(ITOVString**)) {
    TOVPtr<ITOVString> s;
    EXPECT_EQ((object->*get)(s.OutT()), TOV_OK);
    return Utf8(s.Get());
}

/// Why the last parse of a DOM or SAX reader failed.
template <class Parser>
std::string LastError(Parser* parser) {
    return TextOf(parser, &Parser::GetLastError);
}

inline std::string NameOf(const TOVPtr<UTIL::ITOVXmlDomNode>& node) {
    return TextOf(node.Get(), &UTIL::ITOVXmlDomNode::GetName);
}
inline std::string ValueOf(const TOVPtr<UTIL::ITOVXmlDomNode>& node) {
    return TextOf(node.Get(), &UTIL::ITOVXmlDomNode::GetValue);
}

inline TOVPtr<UTIL::ITOVXmlDomNode> ChildOf(const TOVPtr<UTIL::ITOVXmlDomNode>& node, uint32_t index) {
    TOVPtr<UTIL::ITOVXmlDomNode> child;
    EXPECT_EQ(node->GetChild(index, child.OutT()), TOV_OK);
    return child;
}
