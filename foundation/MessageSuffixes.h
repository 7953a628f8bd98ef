#pragma once
// The endings every button-like control appends to its message string when it reports.
inline constexpr const char* latchingBtnDownSuffix_ = " on";
inline constexpr const char* latchingBtnUpSuffix_ = " off";
inline constexpr const char* pressureBtnDownSuffix_ = " pressed";
inline constexpr const char* pressureBtnUpSuffix_ = " released";
inline constexpr const char* pressureBtnDragSuffix_ = " dragged";
