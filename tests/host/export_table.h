// Every entry point the library exports, with the ordinal the host knows it by.
#ifndef MORVEX_TESTS_HOST_EXPORT_TABLE_H
#define MORVEX_TESTS_HOST_EXPORT_TABLE_H

#include <array>
#include <string_view>

namespace morvex::tests {

struct Export {
  int ordinal;
  std::string_view name;
};

// clang-format off
inline constexpr std::array<Export, 72> kExports = {{
    {2, "GetInfos"}, {6, "LoadObject"}, {7, "UnloadObject"}, {8, "PutObject"}, {9, "RemoveObject"},
    {14, "CreateObject"}, {16, "GetHelpFileName"}, {18, "EditObject"}, {19, "GetObjectRect"},
    {21, "IsTransparent"}, {22, "PrepareToWriteObject"}, {23, "UpdateFileNames"},
    {25, "Initialize"}, {26, "Free"}, {30, "UsesFile"}, {31, "CreateFromFile"},
    {32, "DuplicateObject"}, {36, "GetObjInfos"}, {37, "GetTextCaps"}, {38, "GetTextAlignment"},
    {39, "SetTextAlignment"}, {40, "GetTextFont"}, {41, "SetTextFont"}, {42, "GetTextClr"},
    {43, "SetTextClr"}, {44, "GetDependencies"}, {45, "GetFilters"}, {50, "CreateRunObject"},
    {51, "DestroyRunObject"}, {52, "HandleRunObject"}, {53, "DisplayRunObject"},
    {57, "PauseRunObject"}, {58, "ContinueRunObject"}, {59, "GetRunObjectInfos"},
    {60, "GetConditionMenu"}, {61, "GetActionMenu"}, {62, "GetExpressionMenu"},
    {63, "GetConditionCodeFromMenu"}, {64, "GetActionCodeFromMenu"},
    {65, "GetExpressionCodeFromMenu"}, {66, "GetConditionString"}, {67, "GetActionString"},
    {68, "GetExpressionString"}, {69, "InitParameter"}, {70, "EditParameter"},
    {71, "GetParameterString"}, {72, "GetConditionTitle"}, {73, "GetActionTitle"},
    {74, "GetExpressionTitle"}, {75, "GetConditionInfos"}, {76, "GetActionInfos"},
    {77, "GetExpressionInfos"}, {78, "UpdateEditStructure"}, {80, "GetRunObjectDataSize"},
    {85, "StartApp"}, {86, "EndApp"}, {87, "StartFrame"}, {88, "EndFrame"},
    {89, "GetExpressionParam"}, {100, "GetProperties"}, {101, "ReleaseProperties"},
    {102, "GetPropValue"}, {103, "SetPropValue"}, {104, "IsPropEnabled"}, {105, "GetPropCheck"},
    {106, "SetPropCheck"}, {107, "GetPropCreateParam"}, {108, "ReleasePropCreateParam"},
    {109, "EditProp"}, {110, "GetDebugTree"}, {111, "GetDebugItem"}, {112, "EditDebugItem"},
}};
// clang-format on

} // namespace morvex::tests

#endif
