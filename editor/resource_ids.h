/* The numbers of the module's resources and dialog controls. Read by the resource compiler
   as well as by C++, so it holds nothing but #define lines of plain numbers. */
#ifndef MORVEX_EDITOR_RESOURCE_IDS_H
#define MORVEX_EDITOR_RESOURCE_IDS_H

/* Object information (GetObjInfos) and the two tag strings. */
#define IDS_TAG 1
#define IDS_HOST_TAG 2
#define IDS_OBJECT_NAME 128
#define IDS_OBJECT_AUTHOR 129
#define IDS_OBJECT_COPYRIGHT 130
#define IDS_OBJECT_COMMENT 131
#define IDS_OBJECT_WEB 132

/* Parameter prompts. */
#define IDS_PROMPT_INSTANCE_NAME 24000
#define IDS_PROMPT_FUNCTION_NAME 24001
#define IDS_PROMPT_INTEGER 24002
#define IDS_PROMPT_FLOAT 24003
#define IDS_PROMPT_STRING 24004
#define IDS_PROMPT_VARIABLE_NAME 24005
#define IDS_PROMPT_PARAMETER_LIST 24006
#define IDS_PROMPT_RETURN_TYPE 24007
#define IDS_PROMPT_SLOT_NUMBER 24008
#define IDS_PROMPT_ERROR_CODE 24009
#define IDS_PROMPT_OBJECT 24010

/* Display strings and menu commands: the base plus 10 times the code. */
#define IDS_ACTION_BASE 5000
#define IDS_CONDITION_BASE 6000
#define IDS_EXPRESSION_BASE 7000
#define IDM_ACTION_BASE 25000
#define IDM_CONDITION_BASE 26000
#define IDM_EXPRESSION_BASE 27000

/* Menus. */
#define IDR_ACTION_MENU 20000
#define IDR_CONDITION_MENU 20001
#define IDR_EXPRESSION_MENU 20002

/* Dialogs and their controls. */
#define IDD_SETUP 20003
#define IDD_EDIT_FUNCTION 20004
#define IDD_EDIT_VARIABLE 20005
#define IDC_FUNCTION_LIST 20007
#define IDC_VARIABLE_LIST 20008
#define IDC_FUNCTION_NAME 20009
#define IDC_VARIABLE_NAME 20011
#define IDC_NEW_FUNCTION 20013
#define IDC_EDIT_FUNCTION 20014
#define IDC_NEW_VARIABLE 20015
#define IDC_EDIT_VARIABLE 20016
#define IDC_REMOVE_FUNCTION 20017
#define IDC_REMOVE_VARIABLE 20018
#define IDC_VERIFY_NAMES 20020
#define IDC_LOOP_UNTIL_RETURN 20021

/* Bitmaps and data. */
#define IDB_OBJECT 400
#define IDB_OBJECT_SMALL 401
#define IDR_IDENTIFIER 200

#endif
