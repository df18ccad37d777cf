// The contract between the extension and any host that loads it: the host's structures
// that the extension reads, the services it calls back, and the entry points it exports.
//
// A host (the real one, the emulator, the tests) is built against this header alone.
//
// Layouts. On a 32-bit build every offset below is the host's own, pinned by the
// static_asserts at the end of this file. On a 64-bit build pointers and the words that
// carry "an integer, a float's bit pattern or a pointer" are 8 bytes wide, so the byte
// offsets cannot all hold; the fields keep their order and every reserved area is counted
// in pointer-sized words, so the service table stays a table of pointer-sized slots:
//
//   RunHeader (64-bit)     objectCount @120, GenerateEvent @1728, FetchFirstExpressionParam
//                          @1752, FetchNextExpressionParam @1760, FetchActionParam @1856,
//                          FetchActionParamFloat @1872, objectTable @9456
//   ObjectHeader (64-bit)  runHeader @16, hostFlags @248, size 256
//   EditorContext (64-bit) mainWindow @40, HostVersion @672, EditorRequest @680
//   EditStructure          the same bytes on every build (fixed-width fields only)
#ifndef MORVEX_HOST_CONTRACT_H
#define MORVEX_HOST_CONTRACT_H

#include <cstddef>
#include <cstdint>
#include <cstring>

// The host's calling convention: stdcall on 32-bit Windows, the platform's default elsewhere.
#if defined(_WIN32) && !defined(_WIN64)
#define MORVEX_CALL __stdcall
#else
#define MORVEX_CALL
#endif

namespace morvex::host {

// One parameter or result word: an integer, a 32-bit float's bit pattern or a pointer.
using HostWord = std::intptr_t;

// Puts a float's bit pattern into the low 32 bits of a word, and takes it out again.
inline HostWord wordFromFloat(float value) {
  std::uint32_t bits = 0;
  std::memcpy(&bits, &value, sizeof bits);
  return static_cast<HostWord>(bits);
}
inline float floatFromWord(HostWord word) {
  const auto bits = static_cast<std::uint32_t>(word);
  float value = 0;
  std::memcpy(&value, &bits, sizeof value);
  return value;
}

struct ObjectHeader;
struct RunHeader;
struct EditorContext;
struct EditStructure;

// ---------------------------------------------------------------------------------------
// Run time
// ---------------------------------------------------------------------------------------

// Every run-time service takes the object, then two values; their meaning is given with
// each slot of RunHeader below.
using RunService = HostWord(MORVEX_CALL *)(ObjectHeader *object, HostWord first, HostWord second);

// Condition codes the extension raises with GenerateEvent.
inline constexpr HostWord kOnFunction = 0;
inline constexpr HostWord kOnError = 1;
inline constexpr HostWord kOnCreation = 2;
inline constexpr HostWord kOnDestruction = 3;

// Modes of FetchActionParam and types of the expression-parameter fetches.
inline constexpr HostWord kFetchAsIs = -1;   // an integer or a host-owned string pointer
inline constexpr HostWord kFetchFloat = 2;   // a 32-bit float's bit pattern
inline constexpr HostWord kParamInteger = 0; // expression parameter: an integer
inline constexpr HostWord kParamString = 1;  // expression parameter: a string pointer

// Bits of ObjectHeader::hostFlags by which an expression marks the type of its result.
inline constexpr std::uint16_t kFloatResult = 0x4000;
inline constexpr std::uint16_t kStringResult = 0x8000;

// The record of one object of the frame, as the host keeps it (only what "CountSelected("
// reads is named).
struct HostObject {
  std::uint8_t reserved0[18];
  std::int16_t selectionIndex; // 18: number k, counted from 1, in selectionRecords
  std::uint8_t reserved1[8];
  std::uint8_t *selectionRecords; // 28: an array of kSelectionRecordSize-byte records
};
inline constexpr std::size_t kSelectionRecordSize = 114;
inline constexpr std::size_t kSelectedCountOffset = 44; // signed 32-bit, in each record

// One entry of the host's object table; the entry holds no object when `object` is null.
struct ObjectTableEntry {
  HostObject *object;
  HostWord reserved;
};

// The host's run-time header, shared by every object of a frame.
struct RunHeader {
  HostWord reserved0[15];
  std::int32_t objectCount; // 60: number of entries of objectTable
  HostWord reserved1[200];
  RunService GenerateEvent; // 0x360: (condition code, 0); runs the matching lines, nests
  HostWord reserved2[2];
  RunService FetchFirstExpressionParam; // 0x36c: (type, cookie)
  RunService FetchNextExpressionParam;  // 0x370: (type, cookie)
  HostWord reserved3[11];
  RunService FetchActionParam; // 0x3a0: (mode, 0); the next parameter of the running action
  HostWord reserved4;
  RunService FetchActionParamFloat; // 0x3a8: (index from 0, 0); a float's bit pattern
  HostWord reserved5[947];
  ObjectTableEntry *objectTable; // 0x1278
};

// The host's header at the start of every run-time object block. The extension's own
// fields follow it; the host allocates GetRunObjectDataSize bytes and fills this part.
struct ObjectHeader {
  HostWord reserved0[2];
  RunHeader *runHeader; // 8
  HostWord reserved1[28];
  std::uint16_t hostFlags; // 124: result-type bits of the latest expression
  std::uint16_t reserved2;
};

// Routine signatures. A condition gets the object and the first two parameters of its
// event line and answers 1 or 0; an action gets the same and answers 0; an expression gets
// the object and the host's cookie for its parameter fetches and answers one word.
using ConditionRoutine = HostWord(MORVEX_CALL *)(ObjectHeader *object, HostWord param0,
                                                 HostWord param1);
using ActionRoutine = HostWord(MORVEX_CALL *)(ObjectHeader *object, HostWord param0,
                                              HostWord param1);
using ExpressionRoutine = HostWord(MORVEX_CALL *)(ObjectHeader *object, HostWord cookie);

// The record GetRunObjectInfos fills; the host owns it.
struct RunObjectInfos {
  const ConditionRoutine *conditions;   // 0: kConditionCount routines, then a null entry
  const ActionRoutine *actions;         // 4: kActionCount routines, then a null entry
  const ExpressionRoutine *expressions; // 8: kExpressionCount routines, then a null entry
  std::uint16_t conditionCount;         // 12
  std::uint16_t actionCount;            // 14
  std::uint16_t expressionCount;        // 16
  std::uint16_t editStructureSize;      // 18: bytes of a new EditStructure
  std::uint32_t options;                // 20: 0
  std::uint8_t priority;                // 24: 100
  std::uint8_t reserved25;              // 25: not written
  std::uint16_t reserved26;             // 26: 0
  char identifier[4];                   // 28: "3QNZ"
  std::uint16_t editStructureVersion;   // 32
};

inline constexpr std::uint16_t kConditionCount = 4;
inline constexpr std::uint16_t kActionCount = 28;
inline constexpr std::uint16_t kExpressionCount = 25;

// Types in the event-information records the host reads (one record per condition, action
// and expression: menu command, display string, code, flags, parameter count n, n parameter
// types, n prompt string IDs).
namespace eventinfo {
// Parameter types of conditions and actions.
inline constexpr std::uint16_t kStringParam = 45; // a string expression
inline constexpr std::uint16_t kNumberParam = 22; // a numeric expression
inline constexpr std::uint16_t kObjectParam = 1;  // an object chosen from the frame
// Parameter types of expressions.
inline constexpr std::uint16_t kIntegerArgument = 1;
inline constexpr std::uint16_t kStringArgument = 3;
// Result types of expressions, in the flags field.
inline constexpr std::uint16_t kIntegerResult = 0;
inline constexpr std::uint16_t kStringResult = 1;
inline constexpr std::uint16_t kFloatResult = 2;
} // namespace eventinfo

// ---------------------------------------------------------------------------------------
// Edit time
// ---------------------------------------------------------------------------------------

using HostVersionService = std::uint32_t(MORVEX_CALL *)();
using EditorRequestService = HostWord(MORVEX_CALL *)(EditStructure *edit, HostWord request,
                                                     void *propertyList, HostWord a, HostWord b);

// What the host passes first to every edit-time entry point.
struct EditorContext {
  HostWord reserved0[5];
  void *mainWindow; // 20: parent window of the setup dialog
  HostWord reserved1[78];
  HostVersionService HostVersion;     // 336: build in bits 0-11, version in bits 16-31
  EditorRequestService EditorRequest; // 340: (edit, 1, property list, 1, 1)
};

// An object's stored edit-time settings. Little-endian, fixed-width, the same bytes on
// every build. The name entries start at `names` and run on past the end of the struct:
// functionCount function names, then memberCount member names, then 2 bytes of padding.
inline constexpr std::size_t kNameEntrySize = 26; // a name of at most 25 characters and a zero
inline constexpr std::size_t kEditHeadSize = 40;  // bytes before the first name entry
inline constexpr std::int32_t kMaxNames = 500;    // per list
inline constexpr std::uint32_t kEditVersion = 2;

struct EditStructure {
  std::uint32_t size; // 0: 42 + 26 * (functionCount + memberCount)
  std::uint8_t hostHeader0[4];
  std::uint32_t version; // 8: 2 (1 for an older block)
  std::uint8_t hostHeader1[8];
  std::int16_t unused20;
  std::int16_t unused22;
  std::int16_t width;  // 24
  std::int16_t height; // 26
  std::uint8_t unused28;
  std::uint8_t verifyFunctionNames; // 29: "Verify Function Names Before Executing"
  std::uint8_t loopUntilReturn;     // 30: "Loop Functions Until They Return"
  std::uint8_t reserved31;
  std::int32_t functionCount; // 32
  std::int32_t memberCount;   // 36
  char names[kNameEntrySize]; // 40: the first name entry
};

// The number of bytes a block holding the given lists needs.
constexpr std::size_t editStructureSize(std::size_t functionCount, std::size_t memberCount) {
  return kEditHeadSize + kNameEntrySize * (functionCount + memberCount) + 2;
}

// The largest block: 500 function names and 500 member names, 26,042 bytes. The setup
// dialog writes its lists back into the block it was given, in place, so hosts hand
// CreateObject and EditObject blocks of this many bytes (the size field still says how
// many of them are in use).
inline constexpr std::size_t kMaxEditStructureSize = editStructureSize(kMaxNames, kMaxNames);

struct Rect {
  std::int32_t left, top, right, bottom;
};

// ---------------------------------------------------------------------------------------
// Entry points: the names the library exports and their signatures. Every argument and
// result is one word on the stack; "void" entry points give no result.
// ---------------------------------------------------------------------------------------
using MenuHandle = void *;

extern "C" {
using GetInfosFn = HostWord(MORVEX_CALL *)(HostWord code);
using GetObjInfosFn = void(MORVEX_CALL *)(EditorContext *, EditStructure *, char *name,
                                          char *author, char *copyright, char *comment, char *web);
using GetHelpFileNameFn = const char *(MORVEX_CALL *)();
using GetRunObjectInfosFn = HostWord(MORVEX_CALL *)(void *hostContext, RunObjectInfos *infos);
using GetRunObjectDataSizeFn = HostWord(MORVEX_CALL *)(RunHeader *, EditStructure *);
using CreateRunObjectFn = HostWord(MORVEX_CALL *)(ObjectHeader *, EditStructure *, HostWord);
using DestroyRunObjectFn = HostWord(MORVEX_CALL *)(ObjectHeader *, HostWord);
using RunObjectQueryFn = HostWord(MORVEX_CALL *)(ObjectHeader *); // Handle/Display/Pause/Continue
using GetDebugTreeFn = const std::uint16_t *(MORVEX_CALL *)(ObjectHeader *);
using CreateObjectFn = HostWord(MORVEX_CALL *)(EditorContext *, HostWord, EditStructure *);
using EditObjectFn = HostWord(MORVEX_CALL *)(EditorContext *, HostWord, HostWord, EditStructure *);
using GetObjectRectFn = void(MORVEX_CALL *)(EditorContext *, Rect *, HostWord, EditStructure *);
using UpdateEditStructureFn = void *(MORVEX_CALL *)(EditorContext *, EditStructure *);
using GetPropertiesFn = HostWord(MORVEX_CALL *)(EditorContext *, EditStructure *, HostWord);
using GetMenuFn = MenuHandle(MORVEX_CALL *)(EditorContext *, HostWord, HostWord);
using GetCodeFromMenuFn = HostWord(MORVEX_CALL *)(EditorContext *, std::uint16_t command);
using GetInfosRecordFn = const std::uint16_t *(MORVEX_CALL *)(EditorContext *, std::uint16_t code);
using GetStringFn = void(MORVEX_CALL *)(EditorContext *, std::uint16_t code, char *buffer,
                                        std::uint16_t size);
using GetTitleFn = void(MORVEX_CALL *)(EditorContext *, std::uint16_t code, std::uint16_t param,
                                       char *buffer, std::uint16_t size);
using GetExpressionTitleFn = void(MORVEX_CALL *)(EditorContext *, std::uint16_t code, char *buffer,
                                                 std::uint16_t size);
using GetExpressionParamFn = GetTitleFn;
}

// ---------------------------------------------------------------------------------------
// The host's own offsets, on a 32-bit build.
// ---------------------------------------------------------------------------------------
#if INTPTR_MAX == INT32_MAX
static_assert(offsetof(RunHeader, objectCount) == 60);
static_assert(offsetof(RunHeader, GenerateEvent) == 0x360);
static_assert(offsetof(RunHeader, FetchFirstExpressionParam) == 0x36c);
static_assert(offsetof(RunHeader, FetchNextExpressionParam) == 0x370);
static_assert(offsetof(RunHeader, FetchActionParam) == 0x3a0);
static_assert(offsetof(RunHeader, FetchActionParamFloat) == 0x3a8);
static_assert(offsetof(RunHeader, objectTable) == 0x1278);
static_assert(sizeof(ObjectTableEntry) == 8);
static_assert(offsetof(HostObject, selectionIndex) == 18);
static_assert(offsetof(HostObject, selectionRecords) == 28);
static_assert(offsetof(ObjectHeader, runHeader) == 8);
static_assert(offsetof(ObjectHeader, hostFlags) == 124);
static_assert(offsetof(EditorContext, mainWindow) == 20);
static_assert(offsetof(EditorContext, HostVersion) == 336);
static_assert(offsetof(EditorContext, EditorRequest) == 340);
static_assert(offsetof(RunObjectInfos, conditions) == 0);
static_assert(offsetof(RunObjectInfos, actions) == 4);
static_assert(offsetof(RunObjectInfos, expressions) == 8);
static_assert(offsetof(RunObjectInfos, conditionCount) == 12);
static_assert(offsetof(RunObjectInfos, actionCount) == 14);
static_assert(offsetof(RunObjectInfos, expressionCount) == 16);
static_assert(offsetof(RunObjectInfos, editStructureSize) == 18);
static_assert(offsetof(RunObjectInfos, options) == 20);
static_assert(offsetof(RunObjectInfos, priority) == 24);
static_assert(offsetof(RunObjectInfos, reserved26) == 26);
static_assert(offsetof(RunObjectInfos, identifier) == 28);
static_assert(offsetof(RunObjectInfos, editStructureVersion) == 32);
#else
static_assert(offsetof(RunHeader, objectCount) == 120);
static_assert(offsetof(RunHeader, GenerateEvent) == 1728);
static_assert(offsetof(RunHeader, FetchFirstExpressionParam) == 1752);
static_assert(offsetof(RunHeader, FetchNextExpressionParam) == 1760);
static_assert(offsetof(RunHeader, FetchActionParam) == 1856);
static_assert(offsetof(RunHeader, FetchActionParamFloat) == 1872);
static_assert(offsetof(RunHeader, objectTable) == 9456);
static_assert(offsetof(ObjectHeader, runHeader) == 16);
static_assert(offsetof(ObjectHeader, hostFlags) == 248);
static_assert(sizeof(ObjectHeader) == 256);
static_assert(offsetof(EditorContext, mainWindow) == 40);
static_assert(offsetof(EditorContext, HostVersion) == 672);
static_assert(offsetof(EditorContext, EditorRequest) == 680);
#endif

// EditStructure has the same bytes on every build.
static_assert(offsetof(EditStructure, version) == 8);
static_assert(offsetof(EditStructure, width) == 24);
static_assert(offsetof(EditStructure, height) == 26);
static_assert(offsetof(EditStructure, verifyFunctionNames) == 29);
static_assert(offsetof(EditStructure, loopUntilReturn) == 30);
static_assert(offsetof(EditStructure, functionCount) == 32);
static_assert(offsetof(EditStructure, memberCount) == 36);
static_assert(offsetof(EditStructure, names) == kEditHeadSize);
static_assert(sizeof(EditStructure) == editStructureSize(1, 0)); // 68: the size of a new block

} // namespace morvex::host

#endif
