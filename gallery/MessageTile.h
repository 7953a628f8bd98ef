#pragma once
// A clickable tile of the foundation page. A click sends the tile's message to its owner in
// one of the framework's three ways, so the log shows each of them arriving.
#include "platform/glob/Glob.h"

class MessageTile : public Glob {
 public:
  enum class Delivery { Queued, Synchronous, PostedEvent };

  MessageTile(const GlobCreationInfo& info, const String& label, const String& caption,
              const String& message, Delivery delivery);

  int react(Event* e) override;
  void draw() override;
  void handleMouseContainment(bool inside) override;
  MouseCursorID contextCursor(const XY<int>& pos) override { return kCursorHand; }
  const char* idstring() const override { return "tile"; }
  String describeValue() const override { return label_; }

  int sentCount() const { return sent_; }

 private:
  void deliver();

  String label_;
  String caption_;
  String message_;
  Delivery delivery_;
  bool hover_ = false;
  bool pressed_ = false;
  int sent_ = 0;
};
