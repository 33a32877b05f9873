#include "xml/ZEBXmlDoc.h"

#include <memory>

#include "tov/sdk/TOVFailureStyle.h"
#include "tov/sdk/TOVPtr.h"

namespace ZEB {
namespace XMLUtils {

namespace {

[[noreturn]] void Throw(TOVRESULT result) { throw static_cast<int>(result); }

}  // namespace

ZEBXmlDoc::ZEBXmlDoc(ITOVComponentFactory* factory)
    : m_pRoot(nullptr), m_pFactory(factory), m_pReader(nullptr), m_pWriter(nullptr) {
    if (m_pFactory) m_pFactory->AddRef();
}

ZEBXmlDoc::~ZEBXmlDoc() {
    delete m_pRoot;
    if (m_pWriter) m_pWriter->Release();
    if (m_pReader) m_pReader->Release();
    if (m_pFactory) m_pFactory->Release();
}

TOVRESULT ZEBXmlDoc::Open(const ZEBString& path) {
    return Parse([&](UTIL::ITOVXmlParser& reader) { return reader.ParseFile(path.InArg()); });
}

TOVRESULT ZEBXmlDoc::Load(const ZEBString& text) {
    return Parse([&](UTIL::ITOVXmlParser& reader) { return reader.ParseText(text.InArg()); });
}

// The former reader is kept until the new tree stands: a failed parse leaves
// the former tree usable, and a replaced tree is deleted while its DOM lives.
template <class Run>
TOVRESULT ZEBXmlDoc::Parse(Run&& run) {
    return TOVGuarded([&] {
        if (!m_pFactory) Throw(ZEB_E_NOTREADY);
        TOVPtr<UTIL::ITOVXmlParser> reader;
        TOVCheck(
            m_pFactory->CreateComponent(UTIL::CompID_TOVXmlReader, nullptr, UTIL::IID_ITOVXmlParser, reader.Out()));
        TOVCheck(run(*reader));
        TOVPtr<ITOVUnknown> rootObject;
        TOVCheck(reader->GetRoot(rootObject.OutT()));
        TOVPtr<UTIL::ITOVXmlDomNode> rootNode;
        TOVCheck(rootObject->QueryInterface(UTIL::IID_ITOVXmlDomNode, rootNode.Out()));
        std::unique_ptr<ZEBXmlNode> bound(ZEBXmlNode::Bind(&*rootNode));
        auto* root = dynamic_cast<ZEBXmlElement*>(bound.get());
        if (!root) Throw(TOV_E_NOTSUPPORTED);
        bound.release();
        delete m_pRoot;
        m_pRoot = root;
        UTIL::ITOVXmlParser* former = m_pReader;
        m_pReader = reader.Detach();
        if (former) former->Release();
        return TOV_OK;
    });
}

TOVRESULT ZEBXmlDoc::New(const ZEBString& rootTag) {
    return TOVGuarded([&] {
        if (rootTag.IsEmpty()) Throw(TOV_E_INVALIDARG);
        if (!m_pFactory) Throw(ZEB_E_NOTREADY);
        if (m_pRoot) Throw(ZEB_E_DOCOPEN);
        std::unique_ptr<ZEBXmlElement> root(new ZEBXmlElement());
        TOVCheck(root->SetTagName(rootTag));
        m_pRoot = root.release();
        return TOV_OK;
    });
}

TOVRESULT ZEBXmlDoc::Save(const ZEBString& path) {
    return TOVGuarded([&] {
        WriteTree(path.InArg());
        TOVCheck(m_pWriter->Close());
        return TOV_OK;
    });
}

TOVRESULT ZEBXmlDoc::WriteTo(ZEBString& out) {
    return TOVGuarded([&] {
        WriteTree(nullptr);
        TOVCheck(m_pWriter->GetText(out.OutArg()));
        return TOV_OK;
    });
}

void ZEBXmlDoc::WriteTree(ITOVString* path) {
    if (!m_pFactory) Throw(ZEB_E_NOTREADY);
    // Nothing to write is refused before a writer is made.
    if (!m_pRoot) Throw(ZEB_E_NOTREADY);
    if (m_pWriter) {
        m_pWriter->Release();
        m_pWriter = nullptr;
    }
    TOVCheck(m_pFactory->CreateComponent(UTIL::CompID_TOVXmlWriter, nullptr, UTIL::IID_ITOVXmlWriter,
                                         reinterpret_cast<void**>(&m_pWriter)));
    if (!m_pWriter) Throw(TOV_E_POINTER);
    TOVCheck(m_pWriter->Open(path));
    TOVCheck(m_pRoot->Save(m_pWriter));
}

}  // namespace XMLUtils
}  // namespace ZEB
