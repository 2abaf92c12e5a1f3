// The Ostrakon system-information library: kernel information nodes read by
// node number and parameter list. Status 0 means success for every call that
// returns a status.
#pragma once

#include <stdint.h>

extern "C" {

// Opaque to callers: lists are made and freed only by the library.
typedef struct PRB_ParamList PRB_ParamList;
typedef struct PRB_Param PRB_Param;

int PRB_CheckSig(char *workArea, int workAreaLength, int *result);

int PRB_GetInstanceListAlloc(int node, PRB_ParamList *parent, PRB_ParamList **list);
int PRB_Get(int node, PRB_ParamList *params, void *buffer, int bufferSize);

PRB_ParamList *PRB_ParamListCreate(int initialCount, int growBy);
void PRB_ParamListDestroy(PRB_ParamList *list);
int PRB_ParamListUsedCount(PRB_ParamList *list);
int PRB_ParamListAddString(PRB_ParamList *list, const char *text);
int PRB_ParamListAddInt(PRB_ParamList *list, int64_t value);
int PRB_ParamListRemoveLastParam(PRB_ParamList *list);
int PRB_ParamListGetString(PRB_ParamList *list, int index, char **text);
int PRB_ParamListGetInt32(PRB_ParamList *list, int index, int32_t *value);
PRB_Param *PRB_ParamListGetParam(PRB_ParamList *list, int index);
const char *PRB_ParamGetString(PRB_Param *param);

}
