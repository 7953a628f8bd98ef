#pragma once
// Where buttons find their pictures by name. The library ships no image files: the application
// names the directories that hold its icons, and a button asks for "pin.png" rather than a path.
//
// A relative name is looked for in each directory in turn, and the first directory holding a
// regular file of that name wins. An absolute name is used as it is. A name found nowhere is
// returned unchanged, so that loading it fails and the image module draws its placeholder and
// reports the name once.
//
// The directories start as those listed in the environment variable GLOBKIT_IMAGE_PATH
// (separated by ':'), read when the path is first used.
#include <vector>

#include "platform/kw/String.h"

class ImageSearchPath {
 public:
  ImageSearchPath();

  // Appends a directory; an empty name or one already listed is ignored.
  void addDirectory(const String& dir);
  void clear() { dirs_.clear(); }
  const std::vector<String>& directories() const { return dirs_; }

  // The file to load for `name`; empty for an empty name.
  String resolve(const String& name) const;
  String resolve(const WString& name) const;

 private:
  std::vector<String> dirs_;
};

// The process's search path (GUI thread only).
ImageSearchPath& imageSearchPath();
