// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The places of the operations of host_interfaces/framework/ in their tables.

#include "host_interfaces/framework/AVBuffer.h"
#include "host_interfaces/framework/Buffer.h"
#include "host_interfaces/framework/Capability.h"
#include "host_interfaces/framework/ComponentFactory.h"
#include "host_interfaces/framework/Console.h"
#include "host_interfaces/framework/Definitions.h"
#include "host_interfaces/framework/EditorSettings.h"
#include "host_interfaces/framework/HostSettings.h"
#include "host_interfaces/framework/Lock.h"
#include "host_interfaces/framework/String.h"
#include "tests/support/Slots.h"

namespace {

// clang-format off
const SlotRow kFrameworkSlots[] = {
    {"INCFAVBuffer::GetBuffer", 3, SlotOf(&INCFAVBuffer::GetBuffer)},
    {"INCFAVBuffer::GetSampleRange", 4, SlotOf(&INCFAVBuffer::GetSampleRange)},
    {"INCFBuffer::Allocate", 3, SlotOf(&INCFBuffer::Allocate)},
    {"INCFBuffer::GetBufferPointer", 4, SlotOf(&INCFBuffer::GetBufferPointer)},
    {"INCFBuffer::SetComplete", 5, SlotOf(&INCFBuffer::SetComplete)},
    {"INCFCapability::GetValue", 3, SlotOf(&INCFCapability::GetValue)},
    {"INCFComponentFactory::CreateComponent", 3, SlotOf(&INCFComponentFactory::CreateComponent)},
    {"INCFClassFactory::CreateInstance", 3, SlotOf(&INCFClassFactory::CreateInstance)},
    {"INCFConsole::ReservedConsoleOperationA", 3, SlotOf(&INCFConsole::ReservedConsoleOperationA)},
    {"INCFConsole::ReservedConsoleOperationB", 4, SlotOf(&INCFConsole::ReservedConsoleOperationB)},
    {"INCFConsole::Write", 5, SlotOf(&INCFConsole::Write)},
    {"INCFPluginDefinition::SetAttribute", 3, SlotOf(&INCFPluginDefinition::SetAttribute)},
    {"INCFPluginDefinition::ReservedPluginDefinitionA", 4, SlotOf(&INCFPluginDefinition::ReservedPluginDefinitionA)},
    {"INCFPluginDefinition::ReservedPluginDefinitionB", 5, SlotOf(&INCFPluginDefinition::ReservedPluginDefinitionB)},
    {"INCFPluginDefinition::Define", 6, SlotOf(&INCFPluginDefinition::Define)},
    {"INCFComponentDefinition::SetAttribute", 3, SlotOf(&INCFComponentDefinition::SetAttribute)},
    {"INCFComponentDefinition::ReservedComponentDefinitionA", 4, SlotOf(&INCFComponentDefinition::ReservedComponentDefinitionA)},
    {"INCFComponentDefinition::ReservedComponentDefinitionB", 5, SlotOf(&INCFComponentDefinition::ReservedComponentDefinitionB)},
    {"INCFComponentDefinition::Define", 6, SlotOf(&INCFComponentDefinition::Define)},
    {"INCFNMAEditorSettings::GetEditorFrameRate", 3, SlotOf(&INCFNMAEditorSettings::GetEditorFrameRate)},
    {"INCFNMAEditorSettings::GetSingleFrameDuration", 4, SlotOf(&INCFNMAEditorSettings::GetSingleFrameDuration)},
    {"INCFNMAEditorSettings::GetForcedFrameRate", 5, SlotOf(&INCFNMAEditorSettings::GetForcedFrameRate)},
    {"INCFNMAEditorSettings::ReservedEditorSetting", 6, SlotOf(&INCFNMAEditorSettings::ReservedEditorSetting)},
    {"INCFNMAEditorSettings::GetNamedSetting", 7, SlotOf(&INCFNMAEditorSettings::GetNamedSetting)},
    {"IHostSettings::GetHostSettingBoolean", 3, SlotOf(&NMA::IHostSettings::GetHostSettingBoolean)},
    {"INCFLock::Lock", 3, SlotOf(&INCFLock::Lock)},
    {"INCFLock::Unlock", 4, SlotOf(&INCFLock::Unlock)},
    {"INCFString::GetEncoding", 3, SlotOf(&INCFString::GetEncoding)},
    {"INCFString::GetLength", 4, SlotOf(&INCFString::GetLength)},
    {"INCFString::IsEmpty", 5, SlotOf(&INCFString::IsEmpty)},
    {"INCFString::Assign", 6, SlotOf(&INCFString::Assign)},
    {"INCFString::AssignUTF8", 7, SlotOf(&INCFString::AssignUTF8)},
    {"INCFString::AssignUTF16", 8, SlotOf(&INCFString::AssignUTF16)},
    {"INCFString::AssignWCHAR", 9, SlotOf(&INCFString::AssignWCHAR)},
    {"INCFString::ConvertTo", 10, SlotOf(&INCFString::ConvertTo)},
    {"INCFString::ConvertCopy", 11, SlotOf(&INCFString::ConvertCopy)},
    {"INCFString::GetRawUTF8", 12, SlotOf(&INCFString::GetRawUTF8)},
    {"INCFString::GetRawUTF16", 13, SlotOf(&INCFString::GetRawUTF16)},
    {"INCFString::GetRawUTF32", 14, SlotOf(&INCFString::GetRawUTF32)},
    {"INCFString::GetRawWCHAR", 15, SlotOf(&INCFString::GetRawWCHAR)},
    {"INCFString::FindCharacter", 16, SlotOf(&INCFString::FindCharacter)},
    {"INCFString::FindWCHAR", 17, SlotOf(&INCFString::FindWCHAR)},
};
// clang-format on

TEST(FrameworkInterfaces, HaveTheirOperationsInTheirPlaces) {
    ExpectPublishedPlaces(kFrameworkSlots);
}

}  // namespace
