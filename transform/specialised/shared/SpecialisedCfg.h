// What every specialised class begins with: copies of its own kind.
#pragma once

#include <platform/Export.h>
#include <transform/core/TransformerCfg.h>

#include <memory>
#include <type_traits>

// `Class` derives from this with itself as the argument. One whose constructor takes arguments has a blank()
// of its own.
template <typename Class, typename Base = TransformerCfg>
class ORX_EXPORT SpecialisedCfg : public Base {
 public:
  SpecialisedCfg() {
    if constexpr (decltype(leavesAttributesToBase<Class>(0))::value)
      this->setPassesByRules(typeid(Class));
  }

  TransformerCfg* getCopy() const override {
    std::unique_ptr<Class> copy(static_cast<const Class*>(this)->blank());
    copy->assign(this);
    return copy.release();
  }

  // A new object, not configured.
  Class* blank() const { return new Class; }

 private:
  // Takes the operations that decide what becomes of attributes, unless a class overrides one: its own does
  // not convert to the base's.
  static void takeOperations(void (TransformerCfg::*)(const QString&, const QStringList&),
                             void (TransformerCfg::*)(const QHash<QString, QStringList>&),
                             decltype(&TransformerCfg::getOutputAttributes),
                             decltype(&TransformerCfg::transformAttr),
                             decltype(&TransformerCfg::transformAllAttrs),
                             decltype(&TransformerCfg::addAdditionalAttrs));
  template <typename Derived>
  static auto leavesAttributesToBase(int)
      -> decltype(takeOperations(&Derived::setInputAttributes, &Derived::setInputAttributes,
                                 &Derived::getOutputAttributes, &Derived::transformAttr,
                                 &Derived::transformAllAttrs, &Derived::addAdditionalAttrs),
                  std::true_type());
  template <typename>
  static std::false_type leavesAttributesToBase(...);
};
