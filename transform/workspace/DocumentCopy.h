// Hands every record of a read document to a writer.
#pragma once

#include <transform/workspace/IXMLComponentReader.h>
#include <transform/workspace/XMLComponentWriter.h>

// Sub-documents keep their order. What a document holds beyond the writer's vocabulary is not copied:
// WorkspaceLossReport tells.
// One sub-document of it; the sections and attributes of the main document for the empty name.
ORX_EXPORT void copySections(const IXMLComponentReader& reader, const QString& document,
                             XMLComponentWriter& writer);
ORX_EXPORT void copyDocument(const IXMLComponentReader& reader, XMLComponentWriter& writer);
