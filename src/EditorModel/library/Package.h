// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/library/DeployResult.h>
#include <EditorModel/library/InApp.h>
#include <EditorModel/library/PackageContent.h>
#include <EditorModel/library/PackageFetcher.h>
#include <EditorModel/library/PackageStorage.h>
