#pragma once
// Horizontal placement of text in its box. The numbers are the ones controls store and pass
// around (a button's default is Centred).

enum class TextAlignment : int { Left = 0, Right = 1, Centred = 2 };
