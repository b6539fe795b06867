// A document's description for programs. Keys stand in alphabetical order, lists in document order unless
// stated, and the shape is the same for every document:
//
//   file, form ("workspace", "xml" or "versions"), documentType (the root element, or "unknown"), encoding,
//   headerLines (their number) attributes    the root's, by name versions      of a file of versions: name,
//   version, category, guid, line (of its document), bytes datasets      role, keyword, format, dataset,
//   name, enabled, line featureTypes  role, name, node, keyword, geometry, attributes (their number),
//   enabled, line dataTypes, geometryTypes   numbers server        services, repositories, items: lists of
//   names subDocuments  name, version (null when the document does not tell), attributes, ports (name, kind:
//   "input",
//                 "output" or "loop", published), and the sections below
//
// The main document and each sub-document hold:
//
//   globalParameters  name, type, prompt, optional, password, standAlone, server, default (as stored; null
//   for
//                     a password), line
//   transformers      by type: type, subDocument (of instances of custom transformers), count, disabled,
//                     versions (rising)
//   featureLinks      count, disabled
//   attributeLinks, constants   numbers
//   comments          text, line
//   bookmarks         name, description, line
//   breakpoints       name, link, enabled, line
#pragma once

#include <QJsonObject>
#include <QString>

class WorkspaceDocument;

QJsonObject infoJson(const WorkspaceDocument& document, const QString& fileName);
// The name of the document's root element.
QString documentTypeName(const WorkspaceDocument& document);
