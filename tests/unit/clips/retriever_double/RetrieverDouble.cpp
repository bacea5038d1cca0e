// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/unit/clips/retriever_double/RetrieverDouble.h"

RetrieverDouble retriever;

namespace {

alignas(QuickTimeToAAFInfoRetriever) unsigned char place[sizeof(QuickTimeToAAFInfoRetriever)];

}  // namespace

QuickTimeToAAFInfoRetriever* QuickTimeToAAFInfoRetriever::GetInstance() {
    return retriever.exists ? reinterpret_cast<QuickTimeToAAFInfoRetriever*>(place) : nullptr;
}

NCFRESULT QuickTimeToAAFInfoRetriever::GetInfoFromImageDescription(const DescribedPicture* media,
                                                                   AAFInfo* aafInfo,
                                                                   ncfUInt32* vcid) {
    retriever.asked = true;
    ncfUInt32 height = 0;
    (void)media->GetEncodedWidthAndHeight(&retriever.width, &height);
    retriever.record = aafInfo;
    *vcid = 4711;
    return retriever.result;
}
