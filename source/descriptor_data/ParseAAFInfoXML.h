// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#pragma once

#include "host_interfaces/framework/ComponentFactory.h"
#include "source/descriptor_data/GenericXMLDataContainer.h"

// Declares the shape of "AAFInfo.xml" in `container` and loads the file into
// it. Throws NCF_E_FAIL on any failure.
//
//   MediaDescriptorSignature          one entry
//     NivoInfo / ResolutionID         its key, the video compression id
//     groups:CDCIDescriptor           exactly one of these three
//     groups:MPEG2VideoDescriptor
//     groups:RGBADescriptor
void ParseAAFInfoXML(INCFComponentFactory* factory, GenericXMLDataContainer* container,
                     const NMAString& filePath);

// Each declares the values of one kind of descriptor under its node.
NCFRESULT AddCDCIProperties(GenericXMLDataContainer* dataContainer,
                            XMLDataPropertyValue* descriptorNode);
// What an MPEG-2 descriptor has beyond the values of a CDCI descriptor.
NCFRESULT AddMPEG2Properties(GenericXMLDataContainer* dataContainer,
                             XMLDataPropertyValue* descriptorNode);
NCFRESULT AddRGBAProperties(GenericXMLDataContainer* dataContainer,
                            XMLDataPropertyValue* descriptorNode);
