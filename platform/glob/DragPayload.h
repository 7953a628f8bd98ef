#pragma once
// What a drag between Globs carries: a type word that targets decide by ("colour", "text",
// ...) and the data as text in that type's own form.
#include "platform/kw/String.h"

class DragPayload {
 public:
  static constexpr const char* kText = "text";
  // A colour as "#RRGGBB".
  static constexpr const char* kColour = "colour";

  DragPayload() = default;
  DragPayload(String type, String data) : type_(std::move(type)), data_(std::move(data)) {}

  const String& type() const { return type_; }
  const String& data() const { return data_; }
  bool is(const char* type) const { return type && type_ == type; }
  bool empty() const { return type_.empty(); }

 private:
  String type_;
  String data_;
};
