// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/aaf/model/ClassRegistry.h"

#include "host_interfaces/aaf/AAFClassIds.h"
#include "reference_host/aaf/model/DefinitionObjects.h"
#include "reference_host/aaf/model/Dictionary.h"

namespace aaf {

namespace {

const ClassEntry kClasses[] = {
    {AUID_AAFInterchangeObject, &CreateAs<Object>},
    {AUID_AAFDictionary, &CreateAs<Dictionary>},
    {AUID_AAFDefinitionObject, &CreateAs<DefinitionObject>},
    {AUID_AAFDataDefinition, &CreateAs<DataDefinition>},
    {AUID_AAFContainerDefinition, &CreateAs<ContainerDefinition>},
    {AUID_AAFOperationDefinition, &CreateAs<OperationDefinition>},
    {AUID_AAFParameterDefinition, &CreateAs<ParameterDefinition>},
    {AUID_AAFPluginDefinition, &CreateAs<PluginDefinition>},
    {AUID_AAFCodecDefinition, &CreateAs<CodecDefinition>},
    {AUID_AAFInterpolationDefinition, &CreateAs<InterpolationDefinition>},
    {AUID_AAFKLVDataDefinition, &CreateAs<KLVDataDefinition>},
    {AUID_AAFTaggedValueDefinition, &CreateAs<TaggedValueDefinition>},
};

}  // namespace

ClassRegistry::ClassRegistry() {
    Add(kClasses);
}

ObjectCreator ClassRegistry::Find(const GUID& classId) const {
    const auto found = creators_.find(classId);
    return found == creators_.end() ? nullptr : found->second;
}

}  // namespace aaf
