#include "gallery/GalleryPages.h"
#include "gallery/KeyProbe.h"
#include "gallery/MessageTile.h"

// Shows the framework beneath the controls: the three ways a Glob reports to its owner, and the
// key codes the screen delivers.
void buildFoundationPage(GalleryPage& page) {
  const int top = GalleryPage::kContentTop;
  constexpr int kTile = 240, kGap = 16;
  page.addCard("MESSAGE DELIVERY", 0, top, 3 * kTile + 4 * kGap, 200);
  using D = MessageTile::Delivery;
  new MessageTile(page.place(kGap, top + 44, kTile, 140), "Queued message",
                  "send_msg: delivered later, by the loop", "queued hello", D::Queued);
  new MessageTile(page.place(2 * kGap + kTile, top + 44, kTile, 140), "Synchronous call",
                  "call_msg: the owner answers at once", "called now", D::Synchronous);
  new MessageTile(page.place(3 * kGap + 2 * kTile, top + 44, kTile, 140), "Posted event",
                  "event_send: a message event, queued", "event posted", D::PostedEvent);

  page.addCard("KEYBOARD", 0, top + 220, 3 * kTile + 4 * kGap, 110);
  new KeyProbe(page.place(kGap, top + 264, 3 * kTile + 2 * kGap, 48));
}
