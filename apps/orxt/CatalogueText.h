// How the commands of the catalogue show transformers in lists.
#pragma once

#include <QJsonObject>
#include <QString>
#include <QStringList>

#include <vector>

class Console;
class TransformerCfg;

// Up to and with the first full stop that ends a word; all of it when there is none.
QString firstSentence(const QStringList& lines);
// The first sentence of the description; of a custom transformer also its version and file.
QString summaryAsText(const TransformerCfg& transformer);
QJsonObject summaryAsJson(const TransformerCfg& transformer);
// Shown name and first sentence of each, aligned.
void printSummaries(const std::vector<const TransformerCfg*>& transformers, Console& console);
