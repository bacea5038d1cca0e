// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/ClassRegistry.h"

#include "aaf_library/model/DefinitionObjects.h"
#include "aaf_library/model/Dictionary.h"
#include "aaf_library/model/OperationDefinition.h"
#include "aaf_library/model/PluginDefinition.h"
#include "host_interfaces/aaf/AAFClassIds.h"

namespace aaf {

namespace {

const ClassEntry kDefinitionClasses[] = {
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
    Add(kDefinitionClasses);
}

ObjectCreator ClassRegistry::Find(const GUID& classId) const {
    const auto found = creators_.find(classId);
    return found == creators_.end() ? nullptr : found->second;
}

}  // namespace aaf
