#pragma once

#include <string>

#include "plugin/doc_template.h"

// The functions by which the host finds the editor in a plug-in library.
extern "C" {

int VdGetNumDocTemplates();
// A new template, owned by the caller; null for any index but 0.
gridbay::CVdDocTemplate* VdGetDocTemplatePtr(int index);
// The editor's name; 0 when there is nowhere to put it.
int VdGetEditorString(std::string* name);
// The editor has no bitmap and no toolbar.
int VdGetBitmapId();
int VdGetNumToolbars();
int VdGetToolbarString();
int VdInitToolbar();
}
