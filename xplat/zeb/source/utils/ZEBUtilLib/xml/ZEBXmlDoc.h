#pragma once
/// An XML document: the host's parser builds the DOM, and the document holds
/// the lazy tree over it, or a tree made in memory; the host's writer writes
/// the tree out.
///
/// The document holds its reader for as long as the tree lives, because the
/// DOM belongs to the reader. Callers make one document per parse; a second
/// Open or Load replaces the tree, and the former tree is deleted then rather
/// than leaked.
#include "tov/ITOVComponentFactory.h"
#include "tov/ITOVXmlParser.h"
#include "tov/ITOVXmlWriter.h"
#include "xml/ZEBXmlElement.h"

namespace ZEB {
namespace XMLUtils {

class ZEBXmlDoc {
public:
    /// Keeps `factory` with a reference of its own; null makes every parse
    /// and save fail with ZEB_E_NOTREADY.
    explicit ZEBXmlDoc(ITOVComponentFactory* factory);
    ZEBXmlDoc(const ZEBXmlDoc&) = delete;
    ZEBXmlDoc& operator=(const ZEBXmlDoc&) = delete;
    ~ZEBXmlDoc();

    /// Parses the file at `path`. The root is bound, not loaded: children
    /// appear on first use. A root that is not an element is
    /// TOV_E_NOTSUPPORTED. On any failure the document keeps its former tree.
    TOVRESULT Open(const ZEBString& path);
    /// The same for a document held in `text`.
    TOVRESULT Load(const ZEBString& text);
    /// Starts a document in memory with a root of tag `rootTag`:
    /// TOV_E_INVALIDARG for an empty tag, ZEB_E_DOCOPEN when there is a root.
    TOVRESULT New(const ZEBString& rootTag);
    /// The root, owned here; null before a parse or New.
    ZEBXmlElement* DocumentElement() const { return m_pRoot; }
    /// Writes the tree to the file at `path`; ZEB_E_NOTREADY without a root.
    TOVRESULT Save(const ZEBString& path);
    /// Writes the tree into `out` as text; ZEB_E_NOTREADY without a root.
    TOVRESULT WriteTo(ZEBString& out);

private:
    /// Open and Load: `run` makes the new reader parse.
    template <class Run>
    TOVRESULT Parse(Run&& run);
    /// A fresh writer, opened on `path` (null: in memory), with the tree written.
    void WriteTree(ITOVString* path);

    ZEBXmlElement* m_pRoot;
    ITOVComponentFactory* m_pFactory;
    UTIL::ITOVXmlParser* m_pReader;
    UTIL::ITOVXmlWriter* m_pWriter;
};

}  // namespace XMLUtils
}  // namespace ZEB
