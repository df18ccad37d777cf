// Entry points the host calls that have nothing to do for this object: file handling,
// text properties, the property sheet beyond its empty list, and setup and teardown.
// Every argument is one word; those that give a result give a fixed one.
#include "host/boundary.h"

using morvex::host::HostWord;

using W = HostWord;

MORVEX_EXPORT W MORVEX_CALL Initialize(W, W) {
  return 0;
}
MORVEX_EXPORT W MORVEX_CALL Free(W) {
  return 0;
}
MORVEX_EXPORT W MORVEX_CALL GetDependencies() {
  return 0;
}

MORVEX_EXPORT W MORVEX_CALL LoadObject(W, W, W, W) {
  return 0;
}
MORVEX_EXPORT void MORVEX_CALL UnloadObject(W, W, W) {
}
MORVEX_EXPORT void MORVEX_CALL UpdateFileNames(W, W, W, W) {
}
MORVEX_EXPORT void MORVEX_CALL PutObject(W, W, W, W) {
}
MORVEX_EXPORT void MORVEX_CALL RemoveObject(W, W, W, W) {
}
MORVEX_EXPORT void MORVEX_CALL DuplicateObject(W, W, W) {
}
MORVEX_EXPORT W MORVEX_CALL IsTransparent(W, W, W, W, W) {
  return 0;
}
MORVEX_EXPORT W MORVEX_CALL PrepareToWriteObject(W, W, W) {
  return 0;
}
MORVEX_EXPORT W MORVEX_CALL UsesFile(W, W) {
  return 0;
}
MORVEX_EXPORT void MORVEX_CALL CreateFromFile(W, W, W) {
}
MORVEX_EXPORT W MORVEX_CALL GetFilters(W, W, W, W) {
  return 0;
}

MORVEX_EXPORT void MORVEX_CALL ReleaseProperties(W, W, W) {
}
MORVEX_EXPORT W MORVEX_CALL GetPropCreateParam(W, W, W) {
  return 0;
}
MORVEX_EXPORT W MORVEX_CALL GetPropValue(W, W, W) {
  return 0;
}
MORVEX_EXPORT W MORVEX_CALL GetPropCheck(W, W, W) {
  return 0;
}
MORVEX_EXPORT W MORVEX_CALL EditProp(W, W, W) {
  return 0;
}
MORVEX_EXPORT void MORVEX_CALL ReleasePropCreateParam(W, W, W, W) {
}
MORVEX_EXPORT void MORVEX_CALL SetPropValue(W, W, W, W) {
}
MORVEX_EXPORT void MORVEX_CALL SetPropCheck(W, W, W, W) {
}
MORVEX_EXPORT W MORVEX_CALL IsPropEnabled(W, W, W) {
  return 1;
}

MORVEX_EXPORT W MORVEX_CALL GetTextCaps(W, W) {
  return 0;
}
MORVEX_EXPORT W MORVEX_CALL GetTextClr(W, W) {
  return 0;
}
MORVEX_EXPORT W MORVEX_CALL GetTextAlignment(W, W) {
  return 0;
}
MORVEX_EXPORT W MORVEX_CALL GetTextFont(W, W, W, W, W) {
  return 1;
}
MORVEX_EXPORT W MORVEX_CALL SetTextFont(W, W, W, W) {
  return 1;
}
MORVEX_EXPORT void MORVEX_CALL SetTextClr(W, W, W) {
}
MORVEX_EXPORT void MORVEX_CALL SetTextAlignment(W, W, W) {
}
