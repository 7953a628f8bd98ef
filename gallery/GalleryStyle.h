#pragma once
// The gallery's own colours and sizes, around the library's standard palette.
#include "gallery/ChromePainter.h"

namespace GalleryStyle {

inline constexpr Colour kBackdrop = Colour::fromHex(0x2E3035);
inline constexpr Colour kHeaderTop = Colour::fromHex(0x3B3E44);
inline constexpr Colour kHeaderBottom = Colour::fromHex(0x313338);
inline constexpr Colour kSidebar = Colour::fromHex(0x27292D);
inline constexpr Colour kSidebarHover = Colour::fromHex(0x33363B);
inline constexpr Colour kSidebarSelected = Colour::fromHex(0x3A3E45);
inline constexpr Colour kCard = Colour::fromHex(0x3C3F44);
inline constexpr Colour kCardEdge = Colour::fromHex(0x4A4E55);
inline constexpr Colour kCardInset = Colour::fromHex(0x33363B);
inline constexpr Colour kLine = Colour::fromHex(0x16181B);
inline constexpr Colour kLogBack = Colour::fromHex(0x1F2124);
inline constexpr Colour kLogStripe = Colour::fromHex(0x24262A);
inline constexpr Colour kAccent = Colour::fromHex(0x3D8FD6);
inline constexpr Colour kAccentSoft = Colour::fromHex(0x6FB3F2);
inline constexpr Colour kReady = Colour::fromHex(0x5DBB7A);
inline constexpr Colour kPlanned = Colour::fromHex(0x6A6E76);
inline constexpr Colour kTextStrong = Colour::fromHex(0xEEF0F3);
inline constexpr Colour kText = Colour::fromHex(0xC9CCD1);
inline constexpr Colour kTextDim = Colour::fromHex(0x8A8E95);
inline constexpr Colour kTextFaint = Colour::fromHex(0x6A6E76);
inline constexpr Colour kMessage = Colour::fromHex(0xF5C542);

inline constexpr ChromeFont kTitleFont{18, true, false};
inline constexpr ChromeFont kPageTitleFont{22, true, false};
inline constexpr ChromeFont kBodyFont{13, false, false};
inline constexpr ChromeFont kBodyBold{13, true, false};
inline constexpr ChromeFont kCaptionFont{11, true, false};
inline constexpr ChromeFont kSmallFont{11, false, false};
inline constexpr ChromeFont kMonoFont{12, false, true};

}  // namespace GalleryStyle
