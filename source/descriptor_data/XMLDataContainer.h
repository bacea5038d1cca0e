// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/util/NMAString.h"

// Takes the events of one document, in the order of their places in the table.
// An operation may throw a result.
class XMLDataContainer {
public:
    virtual ~XMLDataContainer() = default;
    virtual void Start() = 0;
    virtual void End() = 0;
    virtual void Element(const NMAString& tag) = 0;
    virtual void Text(const NMAString& text) = 0;
    virtual void Attribute(const NMAString& name, const NMAString& value) = 0;
};
