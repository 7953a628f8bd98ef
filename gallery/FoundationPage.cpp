#include "gallery/FoundationDemos.h"
#include "gallery/GalleryPages.h"
#include "gallery/KeyProbe.h"
#include "gallery/MessageTile.h"

// Shows the framework beneath the controls: the three ways a Glob reports to its owner, the key
// codes the screen delivers, one model value driving two bound controls, and a tab order.
void buildFoundationPage(GalleryPage& page) {
  const int top = GalleryPage::kContentTop;
  constexpr int kTile = 240, kGap = 16;
  page.addCard("MESSAGE DELIVERY", 0, top, 3 * kTile + 4 * kGap, 150);
  using D = MessageTile::Delivery;
  new MessageTile(page.place(kGap, top + 40, kTile, 98), "Queued message",
                  "send_msg: delivered later, by the loop", "queued hello", D::Queued);
  new MessageTile(page.place(2 * kGap + kTile, top + 40, kTile, 98), "Synchronous call",
                  "call_msg: the owner answers at once", "called now", D::Synchronous);
  new MessageTile(page.place(3 * kGap + 2 * kTile, top + 40, kTile, 98), "Posted event",
                  "event_send: a message event, queued", "event posted", D::PostedEvent);

  page.addCard("KEYBOARD", 0, top + 164, 3 * kTile + 4 * kGap, 92);
  new KeyProbe(page.place(kGap, top + 202, 3 * kTile + 2 * kGap, 40));

  const int half = (3 * kTile + 4 * kGap - kGap) / 2;
  page.addCard("ONE VALUE, TWO CONTROLS", 0, top + 270, half, 112);
  new BindingDemo(page.place(kGap, top + 308, half - 2 * kGap, 60));
  page.addCard("TAB ORDER  (click a stop, then Tab / Shift+Tab)", half + kGap, top + 270, half,
               112);
  new FocusRow(page.place(half + 2 * kGap, top + 316, half - 2 * kGap, 36), 4);
}
