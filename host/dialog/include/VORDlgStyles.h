// Style words of the dialog objects. Values are the ones the module passes; the named bits are
// those this layer acts on, the other bits are kept and reported only.
#pragma once

// Dialog windows.
inline constexpr int VORDlgWndBtnOK = 0x400;
inline constexpr int VORDlgWndBtnCancel = 0x800;
inline constexpr int VORDlgWndBtnOKCancel = VORDlgWndBtnOK | VORDlgWndBtnCancel;

// Notification windows: icon and buttons (0x10000200: an error with an OK button).
inline constexpr int VORDlgNfyOK = 0x200;
inline constexpr int VORDlgNfyError = 0x10000000;
inline constexpr int VORDlgNfyWarning = 0x20000000;
inline constexpr int VORDlgNfyInformation = 0x40000000;

// Combos: read-only drop-down list.
inline constexpr int VORDlgCmbDropDown = 0x40000;

// Selector lists: one line selected at a time (otherwise several).
inline constexpr int VORDlgLstSingleSelection = 0x1;

// Check button states.
inline constexpr int VORDlgCheck = 0x40000;
inline constexpr int VORDlgUncheck = 0x80000;

// Grid attachment bits; 30 attaches a cell to all four sides.
inline constexpr int VORDlgAttachTop = 2;
inline constexpr int VORDlgAttachBottom = 4;
inline constexpr int VORDlgAttachLeft = 8;
inline constexpr int VORDlgAttachRight = 16;
inline constexpr int VORDlgAttach4Sides = 30;
