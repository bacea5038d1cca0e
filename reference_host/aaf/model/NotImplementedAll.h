// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

// Every interface without operations of its own.
#include "reference_host/aaf/model/NotImplementedComponents.h"
#include "reference_host/aaf/model/NotImplementedDefinitions.h"
#include "reference_host/aaf/model/NotImplementedDescriptors.h"
#include "reference_host/aaf/model/NotImplementedEssenceData.h"
#include "reference_host/aaf/model/NotImplementedFile.h"
#include "reference_host/aaf/model/NotImplementedLocators.h"
#include "reference_host/aaf/model/NotImplementedMetaDefinitions.h"
#include "reference_host/aaf/model/NotImplementedMobs.h"
#include "reference_host/aaf/model/NotImplementedObjects.h"
