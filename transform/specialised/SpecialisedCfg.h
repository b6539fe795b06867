// What every specialised class begins with: copies of its own kind.
#pragma once

#include <platform/Export.h>
#include <transform/core/TransformerCfg.h>

#include <memory>

// `Class` derives from this with itself as the argument. One whose constructor takes arguments has a blank()
// of its own.
template <typename Class, typename Base = TransformerCfg>
class ORX_EXPORT SpecialisedCfg : public Base {
 public:
  TransformerCfg* getCopy() const override {
    std::unique_ptr<Class> copy(static_cast<const Class*>(this)->blank());
    copy->assign(this);
    return copy.release();
  }

  // A new object, not configured.
  Class* blank() const { return new Class; }
};
