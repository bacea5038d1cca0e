// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

// Every published interface.
#include "host_interfaces/aaf/AAFComponents.h"
#include "host_interfaces/aaf/AAFDefinitions.h"
#include "host_interfaces/aaf/AAFDescriptors.h"
#include "host_interfaces/aaf/AAFEssenceData.h"
#include "host_interfaces/aaf/AAFFile.h"
#include "host_interfaces/aaf/AAFLocators.h"
#include "host_interfaces/aaf/AAFMetaDefinitions.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "host_interfaces/aaf/AAFObjects.h"
