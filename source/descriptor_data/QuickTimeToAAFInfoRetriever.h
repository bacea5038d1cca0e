// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/ComponentFactory.h"
#include "host_interfaces/framework/Console.h"
#include "host_interfaces/util/NMAString.h"
#include "source/descriptor_data/AAFInfo.h"
#include "source/descriptor_data/DescribedPicture.h"
#include "source/descriptor_data/FourCharDataContainerReader.h"
#include "source/descriptor_data/GenericXMLDataContainer.h"
#include "source/plugin/NCFSmartPtr.h"
#include "source/plugin/Rational.h"

// Tells which video compression id a clip's picture has and what the data file
// says about that id. One object for the process, made at the first clip with
// video that is described, from the two files beside the module; gone at
// shut-down. After Init all but the two flags is read-only; the flags belong to
// the calling thread.
class QuickTimeToAAFInfoRetriever {
public:
    // Makes the object if there is none; the files are bare names. Every
    // failure gives NCF_E_UNEXPECTED and leaves no object, so the next clip
    // tries again.
    static NCFRESULT Init(NCFSmartPtr<INCFConsole> pConsole,
                          NCFSmartPtr<INCFComponentFactory> pComponentFactory,
                          const char* fourCharXML, const char* AAFInfoXML);
    // Null before Init and after ShutDownInfoRetriever.
    static QuickTimeToAAFInfoRetriever* GetInstance();

    // Fills `aafInfo`, which may be null, for the picture of `media`. `vcid` is
    // written also where the record can't be filled. 0: a natively served
    // picture; NCF_E_NOTSUPPORTED: the code or its geometry is unknown.
    NCFRESULT GetInfoFromImageDescription(const DescribedPicture* media, AAFInfo* aafInfo,
                                          ncfUInt32* vcid);

    // Kind of the record that this thread read last: to be asked right after
    // GetInfoFromImageDescription.
    bool IsMPEGDescriptor() const;
    bool IsRGBADescriptor() const;

    QuickTimeToAAFInfoRetriever(const QuickTimeToAAFInfoRetriever&) = delete;
    QuickTimeToAAFInfoRetriever& operator=(const QuickTimeToAAFInfoRetriever&) = delete;

private:
    friend void ShutDownInfoRetriever();

    // Reads both files; throws a result when either can't be read.
    QuickTimeToAAFInfoRetriever(const NCFSmartPtr<INCFConsole>& pConsole,
                                INCFComponentFactory* pComponentFactory,
                                const NMAString& fourCharPath, const NMAString& aafInfoPath);
    ~QuickTimeToAAFInfoRetriever() = default;

    // What the record of a picture is looked up by.
    struct Query {
        ncfUInt32 vcid;
        Rational editRate;
        ncfUInt32 width;
        ncfUInt32 height;  // of a field where the picture is stored in fields
    };
    NCFRESULT FillInfo(const Query& query, AAFInfo& aafInfo);
    NCFRESULT ReadRecord(const Query& query, AAFInfo& aafInfo, const char** failedCall);
    void ReportUnknownCode(ncfUInt32 fourCC);
    void ReportUnknownId(const Query& query);

    INCFComponentFactory* m_factory;  // borrowed: the host outlives the module
    GenericXMLDataContainer m_dataContainer;
    FourCharDataContainerReader m_fourCharReader;
    NCFSmartPtr<INCFConsole> m_console;
};

// Deletes the retriever; harmless when there is none.
void ShutDownInfoRetriever();
