// Reads the definition files and localised companions of folders and enters what they hold in the registry's
// tables. Only what that needs is read: an entry makes its prototype when it is asked for.
#pragma once

#include <transform/files/FileBytes.h>
#include <transform/registry/catalogue/CatalogueEntry.h>
#include <transform/registry/loading/DefinitionIndex.h>

#include <QString>
#include <QStringList>

#include <functional>
#include <memory>

class CategoryTexts;
class ExceptionList;
class PrototypeTable;

class DefinitionLoader {
 public:
  // Takes a file that is a workspace, and therefore a custom transformer.
  using CustomTransformerLoad = std::function<void(const QString& path)>;

  // None of the tables is owned; all outlive this object. Without `load` only custom transformers are loaded.
  DefinitionLoader(PrototypeTable& prototypes, CategoryTexts& categories, const ExceptionList& exceptions,
                   std::shared_ptr<const DefinitionLoad> load, CustomTransformerLoad loadCustom);

  void loadFolder(const QString& folder);
  // What failed, in the order in which it was met; each text names the file.
  const QStringList& errors() const { return m_errors; }

 private:
  void loadFile(const QString& path);
  void loadCompanion(const QString& path);
  bool readAll(const QString& path);
  void define(IndexedDefinition& definition, const QString& path);
  // Tells what of the indexed file is lost.
  void noteLosses(const QString& path);
  void noteUnreadable(const QString& path, const QString& reason);
  void note(const QString& error);

  PrototypeTable& m_prototypes;
  CategoryTexts& m_categories;
  const ExceptionList& m_exceptions;
  std::shared_ptr<const DefinitionLoad> m_load;
  CustomTransformerLoad m_loadCustom;
  // Kept from file to file.
  FileBytes m_file;
  DefinitionIndex m_index;
  QStringList m_errors;
};
