// Texts that can do no harm to a mapping file, wherever they stand in it.
#pragma once

#include <QString>

// Whether nothing in the text is ever quoted, expanded, run or taken for a clause.
bool isHarmlessText(const QString& text);
