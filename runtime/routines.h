// Every condition, action and expression routine, by code. The routine tables
// (routine_tables.h) wrap them in the host's calling convention.
//
// Shapes: a condition answers true or false; an action gives nothing (0 to the host); an
// expression answers one word and marks a float or string result in hostFlags. Conditions
// and actions get the first two parameters of their event line directly; expressions get
// the host's cookie for their parameter fetches.
#ifndef MORVEX_RUNTIME_ROUTINES_H
#define MORVEX_RUNTIME_ROUTINES_H

#include "host/contract.h"
#include "runtime/run_object.h"

namespace morvex::runtime {

using host::HostWord;

// Conditions (calls.cpp).
bool onFunction(RunObject &object, HostWord name, HostWord);   // 0
bool alwaysTrue(RunObject &object, HostWord, HostWord);        // 1, 2, 3

// Actions.
void callFunctionForInstance(RunObject &object, HostWord, HostWord); // 0  calls.cpp
void setMemberInteger(RunObject &object, HostWord, HostWord);        // 1  instances.cpp
void setMemberFloat(RunObject &object, HostWord, HostWord);          // 2
void setMemberString(RunObject &object, HostWord, HostWord);         // 3
void callFunctionForCurrent(RunObject &object, HostWord, HostWord);  // 4  calls.cpp
void setCurrentMemberInteger(RunObject &object, HostWord member, HostWord value); // 5 instances.cpp
void setCurrentMemberFloat(RunObject &object, HostWord member, HostWord);         // 6
void setCurrentMemberString(RunObject &object, HostWord member, HostWord text);   // 7
void createInstance(RunObject &object, HostWord name, HostWord parameters);       // 8
void destroyInstance(RunObject &object, HostWord name, HostWord);                 // 9
void returnVoid(RunObject &object, HostWord, HostWord);                 // 10 calls.cpp
void returnInteger(RunObject &object, HostWord value, HostWord);        // 11
void returnFloat(RunObject &object, HostWord, HostWord);                // 12
void returnString(RunObject &object, HostWord text, HostWord);          // 13
void createGlobalVariable(RunObject &object, HostWord name, HostWord);  // 14 variables.cpp
void setGlobalInteger(RunObject &object, HostWord name, HostWord value); // 15
void setGlobalFloat(RunObject &object, HostWord name, HostWord);        // 16
void setGlobalString(RunObject &object, HostWord name, HostWord text);  // 17
void createLocalVariable(RunObject &object, HostWord name, HostWord);   // 18
void setLocalInteger(RunObject &object, HostWord name, HostWord value); // 19
void setLocalFloat(RunObject &object, HostWord name, HostWord);         // 20
void setLocalString(RunObject &object, HostWord name, HostWord text);   // 21
void clearExpressionErrorCode(RunObject &object, HostWord, HostWord);   // 22 errors.cpp
void loopCurrentFunction(RunObject &object, HostWord, HostWord);        // 23 calls.cpp
void setDefaultInstance(RunObject &object, HostWord name, HostWord);    // 24 instances.cpp
void generateError(RunObject &object, HostWord code, HostWord);         // 25 errors.cpp
void destroyAllInstances(RunObject &object, HostWord, HostWord);        // 26 instances.cpp
void countAllSelected(RunObject &object, HostWord, HostWord);           // 27 selection.cpp

// Expressions.
HostWord integerSlot(RunObject &object, HostWord cookie);          // 0  calls.cpp
HostWord floatSlot(RunObject &object, HostWord cookie);            // 1
HostWord stringSlot(RunObject &object, HostWord cookie);           // 2
HostWord intOfInstance(RunObject &object, HostWord cookie);        // 3  instances.cpp
HostWord floatOfInstance(RunObject &object, HostWord cookie);      // 4
HostWord stringOfInstance(RunObject &object, HostWord cookie);     // 5
HostWord intOfCurrInstance(RunObject &object, HostWord cookie);    // 6
HostWord floatOfCurrInstance(RunObject &object, HostWord cookie);  // 7
HostWord stringOfCurrInstance(RunObject &object, HostWord cookie); // 8
HostWord globalInt(RunObject &object, HostWord cookie);            // 9  variables.cpp
HostWord globalFloat(RunObject &object, HostWord cookie);          // 10
HostWord globalString(RunObject &object, HostWord cookie);         // 11
HostWord localInt(RunObject &object, HostWord cookie);             // 12
HostWord localFloat(RunObject &object, HostWord cookie);           // 13
HostWord localString(RunObject &object, HostWord cookie);          // 14
HostWord functionLoopNumber(RunObject &object, HostWord cookie);   // 15 calls.cpp
HostWord currentError(RunObject &object, HostWord cookie);         // 16 errors.cpp
HostWord formatString(RunObject &object, HostWord cookie);         // 17 parameters.cpp
HostWord unformatString(RunObject &object, HostWord cookie);       // 18
HostWord getInstanceName(RunObject &object, HostWord cookie);      // 19 instances.cpp
HostWord getReturnType(RunObject &object, HostWord cookie);        // 20 calls.cpp
HostWord expressionError(RunObject &object, HostWord cookie);      // 21 errors.cpp
HostWord numberOfParameters(RunObject &object, HostWord cookie);   // 22 calls.cpp
HostWord objectVersion(RunObject &object, HostWord cookie);        // 23 selection.cpp
HostWord countSelected(RunObject &object, HostWord cookie);        // 24

} // namespace morvex::runtime

#endif
