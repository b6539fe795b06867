// What the fields of a transformer's record mean to whoever builds a graph from records.
#pragma once

#include <platform/Export.h>
#include <transform/workspace/WorkspaceRecords.h>

#include <QString>
#include <QStringList>

#include <vector>

// The instance's name; without one its type, "_" and its number.
ORX_EXPORT QString transformerTitle(const TransformerStruct& record);

// The parameter of an instance that names its custom transformer. It is no parameter of the custom
// transformer.
inline const QLatin1String kSubDocumentNameParameter("SUB_DOC_NAME");
// Empty when the record is no instance of a custom transformer, or names none.
ORX_EXPORT QString subDocumentName(const TransformerStruct& record);

// Reads the description of a feature port at one end of a link. False when it describes something else.
ORX_EXPORT bool readFeaturePort(const QString& description, bool wantsOutput, unsigned& number,
                                QString& name);

// The ports of an input order. Its text is a list packed with commas, one entry per port; each entry is a
// list packed with blanks: the port's tag, then the flows that enter there, in their order.
ORX_EXPORT std::vector<QStringList> readPortOrder(const QString& text);
