// What the configuration floor asks of the workspace around a transformer: which parameter references exist.
#pragma once

#include <platform/Export.h>

#include <QString>

class ORX_EXPORT WorkspaceParameterDirectory {
 public:
  virtual ~WorkspaceParameterDirectory();
  // Each is asked with a whole reference, "$(NAME)".
  virtual bool isPublishedParameter(const QString& reference) const = 0;
  virtual bool isPrivateParameter(const QString& reference) const = 0;
  virtual bool isBuiltInParameter(const QString& reference) const = 0;

  bool knows(const QString& reference) const {
    return isPublishedParameter(reference) || isPrivateParameter(reference) || isBuiltInParameter(reference);
  }
};
