// The registry of all objects that the library has made and that are not ended yet.
#pragma once

#include <string>

#include "hostutil/HostSetup.h"

namespace hostutil {

// An object of the registry: making one enters it, destroying one takes it out, both in constant time.
class LiveObject {
 public:
  enum class Kind { File = HOST_LEDGER_FILE, List = HOST_LEDGER_LIST, Text };

  LiveObject(const LiveObject&) = delete;
  LiveObject& operator=(const LiveObject&) = delete;
  virtual ~LiveObject();

  // One line of UTF-8 for the ledger.
  virtual std::string Describe() const = 0;

  LiveObject* Next() const { return next_; }
  Kind GetKind() const { return kind_; }

  // Whether a rehearsal has made the object's own release fail.
  bool ReleaseFailed() const { return releaseFailed_; }
  void MarkReleaseFailed() { releaseFailed_ = true; }

 protected:
  explicit LiveObject(Kind kind);

 private:
  LiveObject* previous_;
  LiveObject* next_ = nullptr;
  Kind kind_;
  bool releaseFailed_ = false;
};

}  // namespace hostutil
