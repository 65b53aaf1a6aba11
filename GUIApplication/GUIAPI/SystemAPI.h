#ifndef SYSTEMAPI_H
#define SYSTEMAPI_H

// Bool-valued calls over the CmdOut_ commands for the model and the
// screens: true when the command's status is 0.

// Reads every user setting from the server's parameters into UserParams.
// Each read stands alone: a failed one leaves its field and makes the
// result false.
bool SysAPI_GetUserParams();
// Writes the user settings back as parameters; false if any write failed.
bool SysAPI_SetUserParams();

#endif // SYSTEMAPI_H
