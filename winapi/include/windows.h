// Linux stand-in for <windows.h>: the subset of the Windows API that the extension's editor
// side uses, implemented by libwinapi.so (winapi/*.cpp), which plays user32 and kernel32.
//
// The values are those of the real API, so the resource script means the same on both
// systems. Sections are kept apart so each group of services can grow on its own.
#ifndef MORVEX_WINAPI_WINDOWS_H
#define MORVEX_WINAPI_WINDOWS_H

#include <cstddef>
#include <cstdint>

// ---------------------------------------------------------------------------------------
// Calling conventions and linkage
// ---------------------------------------------------------------------------------------
#define WINAPI
#define CALLBACK
#define APIENTRY
#define WINUSERAPI __attribute__((visibility("default")))
#define WINBASEAPI __attribute__((visibility("default")))

// ---------------------------------------------------------------------------------------
// Basic types
// ---------------------------------------------------------------------------------------
typedef int BOOL;
typedef unsigned char BYTE;
typedef std::uint16_t WORD;
typedef std::uint32_t DWORD;
typedef int INT;
typedef unsigned int UINT;
typedef std::int32_t LONG;
typedef std::intptr_t INT_PTR;
typedef std::uintptr_t UINT_PTR;
typedef std::intptr_t LONG_PTR;
typedef std::uintptr_t ULONG_PTR;
typedef std::size_t SIZE_T;
typedef UINT_PTR WPARAM;
typedef LONG_PTR LPARAM;
typedef LONG_PTR LRESULT;
typedef char CHAR;
typedef char *LPSTR;
typedef const char *LPCSTR;
typedef void *LPVOID;
typedef const void *LPCVOID;
typedef void *HANDLE;
typedef ULONG_PTR DWORD_PTR;

#define TRUE 1
#define FALSE 0

// Handles are pointers to distinct incomplete types, so they cannot be mixed up.
struct HINSTANCE__;
struct HMENU__;
struct HWND__;
typedef HINSTANCE__ *HINSTANCE;
typedef HINSTANCE HMODULE;
typedef HMENU__ *HMENU;
typedef HWND__ *HWND;
typedef void *HGLOBAL; // with GMEM_FIXED the handle is the block's address
typedef void *HLOCAL;  // with LMEM_FIXED likewise

#define LOWORD(l) ((WORD)(((DWORD_PTR)(l)) & 0xffff))
#define HIWORD(l) ((WORD)((((DWORD_PTR)(l)) >> 16) & 0xffff))

// A resource named by number rather than by text.
#define MAKEINTRESOURCEA(i) ((LPSTR)((ULONG_PTR)((WORD)(i))))
#define MAKEINTRESOURCE MAKEINTRESOURCEA
#define IS_INTRESOURCE(r) ((((ULONG_PTR)(r)) >> 16) == 0)

// ---------------------------------------------------------------------------------------
// Window, dialog and control styles (used by the resource script)
// ---------------------------------------------------------------------------------------
#define WS_POPUP 0x80000000L
#define WS_CHILD 0x40000000L
#define WS_VISIBLE 0x10000000L
#define WS_CAPTION 0x00C00000L
#define WS_BORDER 0x00800000L
#define WS_VSCROLL 0x00200000L
#define WS_HSCROLL 0x00100000L
#define WS_SYSMENU 0x00080000L
#define WS_GROUP 0x00020000L
#define WS_TABSTOP 0x00010000L

#define DS_3DLOOK 0x0004L
#define DS_SETFONT 0x40L
#define DS_MODALFRAME 0x80L

#define BS_PUSHBUTTON 0x00000000L
#define BS_DEFPUSHBUTTON 0x00000001L
#define BS_CHECKBOX 0x00000002L
#define BS_AUTOCHECKBOX 0x00000003L
#define BS_GROUPBOX 0x00000007L

#define SS_LEFT 0x00000000L
#define SS_CENTER 0x00000001L
#define SS_RIGHT 0x00000002L

#define ES_LEFT 0x0000L
#define ES_LOWERCASE 0x0010L
#define ES_AUTOHSCROLL 0x0080L

#define LBS_NOTIFY 0x0001L
#define LBS_SORT 0x0002L
#define LBS_STANDARD (LBS_NOTIFY | LBS_SORT | WS_VSCROLL | WS_BORDER)

// ---------------------------------------------------------------------------------------
// Messages, notifications and results
// ---------------------------------------------------------------------------------------
#define WM_CLOSE 0x0010
#define WM_INITDIALOG 0x0110
#define WM_COMMAND 0x0111

#define BN_CLICKED 0
#define BM_GETCHECK 0x00F0
#define BM_SETCHECK 0x00F1
#define BST_UNCHECKED 0x0000
#define BST_CHECKED 0x0001

#define EM_LIMITTEXT 0x00C5
#define EM_SETLIMITTEXT EM_LIMITTEXT

#define LBN_SELCHANGE 1
#define LBN_DBLCLK 2
#define LB_ADDSTRING 0x0180
#define LB_DELETESTRING 0x0182
#define LB_RESETCONTENT 0x0184
#define LB_SETCURSEL 0x0186
#define LB_GETCURSEL 0x0188
#define LB_GETTEXT 0x0189
#define LB_GETTEXTLEN 0x018A
#define LB_GETCOUNT 0x018B
#define LB_FINDSTRINGEXACT 0x01A2
#define LB_ERR (-1)

#define IDOK 1
#define IDCANCEL 2

// ---------------------------------------------------------------------------------------
// Memory: the global and the local heap (winapi/memory.cpp)
// ---------------------------------------------------------------------------------------
#define GMEM_FIXED 0x0000
#define GMEM_MOVEABLE 0x0002
#define GMEM_ZEROINIT 0x0040
#define GPTR (GMEM_FIXED | GMEM_ZEROINIT)
#define LMEM_FIXED 0x0000
#define LMEM_ZEROINIT 0x0040
#define LPTR (LMEM_FIXED | LMEM_ZEROINIT)

extern "C" {
// Only fixed blocks exist here: GMEM_MOVEABLE and LMEM_MOVEABLE are refused (null). A
// block belongs to whoever asked for it (or was handed it) until GlobalFree or LocalFree;
// its handle is its address, which GlobalLock answers.
WINBASEAPI HGLOBAL WINAPI GlobalAlloc(UINT flags, SIZE_T bytes);
WINBASEAPI HGLOBAL WINAPI GlobalFree(HGLOBAL block); // null on success
WINBASEAPI LPVOID WINAPI GlobalLock(HGLOBAL block);
WINBASEAPI BOOL WINAPI GlobalUnlock(HGLOBAL block);
WINBASEAPI SIZE_T WINAPI GlobalSize(HGLOBAL block);
WINBASEAPI HLOCAL WINAPI LocalAlloc(UINT flags, SIZE_T bytes);
WINBASEAPI HLOCAL WINAPI LocalFree(HLOCAL block); // null on success
}

// ---------------------------------------------------------------------------------------
// String resources (winapi/strings.cpp)
// ---------------------------------------------------------------------------------------
extern "C" {
// Copies string resource `id` of `module` into `buffer`: at most size - 1 characters and a
// terminating zero. Answers the number of characters copied; 0 when there is no such
// string (the buffer then holds an empty string) or when size is 0 (nothing is written).
WINUSERAPI int WINAPI LoadStringA(HINSTANCE module, UINT id, LPSTR buffer, int size);
}

// ---------------------------------------------------------------------------------------
// Menus (winapi/menus.cpp)
// ---------------------------------------------------------------------------------------
#define MF_BYCOMMAND 0x00000000L
#define MF_STRING 0x00000000L
#define MF_ENABLED 0x00000000L
#define MF_UNCHECKED 0x00000000L
#define MF_GRAYED 0x00000001L
#define MF_DISABLED 0x00000002L
#define MF_BITMAP 0x00000004L
#define MF_CHECKED 0x00000008L
#define MF_POPUP 0x00000010L
#define MF_MENUBARBREAK 0x00000020L
#define MF_MENUBREAK 0x00000040L
#define MF_HILITE 0x00000080L
#define MF_OWNERDRAW 0x00000100L
#define MF_BYPOSITION 0x00000400L
#define MF_SEPARATOR 0x00000800L
#define MF_DEFAULT 0x00001000L
#define MF_HELP 0x00004000L

extern "C" {
// A menu belongs to whoever created or loaded it until DestroyMenu; a pop-up appended to
// another menu then belongs to that menu and is destroyed with it.
WINUSERAPI HMENU WINAPI LoadMenuA(HINSTANCE module, LPCSTR name);
WINUSERAPI HMENU WINAPI CreatePopupMenu(void);
WINUSERAPI HMENU WINAPI CreateMenu(void);
WINUSERAPI BOOL WINAPI DestroyMenu(HMENU menu);
// Appends a separator (MF_SEPARATOR), a pop-up (MF_POPUP: `item` is its HMENU) or a text
// item with command `item`.
WINUSERAPI BOOL WINAPI AppendMenuA(HMENU menu, UINT flags, UINT_PTR item, LPCSTR text);
WINUSERAPI int WINAPI GetMenuItemCount(HMENU menu); // -1 for an invalid menu
// The pop-up under item `position`; null when the item opens none. Still owned by `menu`.
WINUSERAPI HMENU WINAPI GetSubMenu(HMENU menu, int position);
// The command of item `position`: 0 for a separator, (UINT)-1 for a pop-up or no item.
WINUSERAPI UINT WINAPI GetMenuItemID(HMENU menu, int position);
// The item's flags; for a pop-up, its item count in the high byte. (UINT)-1 for no item.
WINUSERAPI UINT WINAPI GetMenuState(HMENU menu, UINT item, UINT flags);
// Copies the item's text (at most size - 1 characters and a zero); answers its length.
// MF_BYCOMMAND searches the pop-ups too. 0 and nothing written when there is no item.
WINUSERAPI int WINAPI GetMenuStringA(HMENU menu, UINT item, LPSTR buffer, int size, UINT flags);
}

// ---------------------------------------------------------------------------------------
// Message boxes (winapi/message_box.cpp)
// ---------------------------------------------------------------------------------------
#define MB_OK 0x00000000L
#define MB_OKCANCEL 0x00000001L
#define MB_ICONHAND 0x00000010L
#define MB_ICONERROR MB_ICONHAND
#define MB_ICONEXCLAMATION 0x00000030L
#define MB_ICONWARNING MB_ICONEXCLAMATION

extern "C" {
// Nobody is there to read it: the box is handed to the hook of winapi/hooks.h, if any,
// and otherwise answers IDOK at once.
WINUSERAPI int WINAPI MessageBoxA(HWND owner, LPCSTR text, LPCSTR caption, UINT type);
}

// (Further sections go above this line.)
#endif
