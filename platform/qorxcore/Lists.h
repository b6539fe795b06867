// Lists of texts packed into one text, and back.
#pragma once

#include <platform/Export.h>

#include <QString>
#include <QStringList>

// Splits a packed list; the exact inverse of QORXListToSdfString for every list. An empty text is the empty
// list. A quoted element has its doubled inner quotes halved; a quote that never closes runs to the end.
// Blanks around a quoted element are dropped, other text behind its closing quote is kept; an element without
// quotes keeps its blanks.
ORX_EXPORT QStringList QORXSdfStringToList(const QString& text, QChar separator,
                                           QChar quote = QLatin1Char('"'));

// Packs a list. An element that is empty, holds the separator, the quote or a line break, or begins or ends
// with a blank is wrapped in quotes, its inner quotes doubled. When the separator is the quote itself,
// packing and splitting take the other of the two quotes, double and single.
ORX_EXPORT QString QORXListToSdfString(const QStringList& list, QChar separator,
                                       QChar quote = QLatin1Char('"'));

// The lenient splitter for lists that people type: also takes an element wrapped in braces, drops empty
// pieces and the blanks around the others. Braces nest; one that never closes runs to the end, and text
// behind a closing one makes the braces part of the element.
ORX_EXPORT QStringList QORXStringToList(const QString& text, QChar separator);
