// How the commands of the catalogue show transformers in lists.
#pragma once

#include <QJsonObject>
#include <QString>
#include <QStringList>

#include <memory>
#include <vector>

class Console;
class TransformerCfg;
class TransformerMgr;

// Up to and with the first full stop that ends a word; all of it when there is none.
QString firstSentence(const QStringList& lines);
// The first sentence of the description; of a custom transformer also its version and file.
QString summaryAsText(const TransformerCfg& transformer);
QJsonObject summaryAsJson(const TransformerCfg& transformer);
// Shown name and first sentence of each, aligned.
void printSummaries(const std::vector<const TransformerCfg*>& transformers, Console& console);

// Copies of all transformers, newest version each, by name; `all` takes those in that are no longer
// offered.
std::vector<std::unique_ptr<TransformerCfg>> offeredTransformers(TransformerMgr& registry, bool all);

// A copy of the version asked for, by name, alias or shown name. Null when there is none: `error` then says
// so, and which name or version was probably meant.
std::unique_ptr<TransformerCfg> findTransformer(TransformerMgr& registry, const QString& name, int version,
                                                QString& error);
// "did you mean ...?" when one of the candidates comes close to the name, else the other text.
QString orNearest(const QString& name, const QStringList& candidates, const QString& otherwise);
