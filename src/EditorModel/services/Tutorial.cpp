// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/services/Tutorial.h>

#include "moc_Tutorial.cpp"
