#pragma once
// The primary face of every Glob: something that can be told of changes by NotifyMsg. The
// operations themselves are Glob's; this base only fixes that the Glob table starts here.
class Notifiable {
 public:
  virtual ~Notifiable() = default;
};
