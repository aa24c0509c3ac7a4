// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/media/Audio.h>
#include <EditorModel/media/File.h>
#include <EditorModel/media/FileTarget.h>
#include <EditorModel/media/Object.h>
#include <EditorModel/media/Source.h>
#include <EditorModel/media/TimingMode.h>
#include <EditorModel/media/Video.h>
#include <EditorModel/media/Views.h>
