// The lines of a template, in which texts take the place of tokens "$(NAME)".
#pragma once

#include <QString>
#include <QStringList>

class Substitution {
 public:
  Substitution() = default;
  virtual ~Substitution() = default;
  Substitution(const Substitution&) = delete;
  Substitution& operator=(const Substitution&) = delete;

  // Whether a line that is left holds the token.
  virtual bool contains(const QString& token) const = 0;
  virtual void substitute(const QString& token, const QString& text) = 0;
  virtual void removeLinesWith(const QString& token) = 0;
  // The clause of an output that leaves no trace.
  virtual void removeOutput(const QString& tag) = 0;
  // What is left, in order.
  virtual QStringList lines() const = 0;
};
