#pragma once
// A face of every Glob for the drawing layer's font bookkeeping. It sits with Glob, below the
// drawing layer, because every Glob carries it; it holds no state, so it costs a Glob only its
// table pointer.
namespace Glib {

class FontUser {
 public:
  virtual ~FontUser() = default;
};

}  // namespace Glib
