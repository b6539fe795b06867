// Judges what a document says, apart from the graph that is built of it: malformed values, elements and
// attributes that nobody knows, lines between its lines, and parameters that one node is given twice.
#pragma once

class WorkspaceDocument;

namespace orx {
class Findings;
}

void checkDocument(const WorkspaceDocument& document, orx::Findings& findings);
