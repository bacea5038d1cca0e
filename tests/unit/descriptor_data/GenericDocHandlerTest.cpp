// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/descriptor_data/GenericDocHandler.h"

#include <gtest/gtest.h>

#include <stdexcept>

#include "tests/unit/descriptor_data/DataHost.h"

namespace {

// Writes its calls down and throws on demand.
class FakeContainer final : public XMLDataContainer {
public:
    enum class Throw { kNothing, kResult, kOther };
    Throw throws = Throw::kNothing;
    std::vector<std::string> calls;

    void Start() override { Call("Start"); }
    void End() override { Call("End"); }
    void Element(const NMAString& tag) override { Call(std::string("Element ") + Utf8(tag)); }
    void Text(const NMAString& text) override { Call(std::string("Text ") + Utf8(text)); }
    void Attribute(const NMAString& name, const NMAString& value) override {
        Call(std::string("Attribute ") + Utf8(name) + "=" + Utf8(value));
    }

private:
    static const char* Utf8(const NMAString& text) { return text.GetUTF8String(); }
    void Call(const std::string& call) {
        calls.push_back(call);
        if (throws == Throw::kResult) {
            throw NCF_E_NOTFOUND;
        }
        if (throws == Throw::kOther) {
            throw std::runtime_error("not a result");
        }
    }
};

class GenericDocHandlerTest : public DataHost {
protected:
    GenericDocHandlerTest() {
        EXPECT_EQ(
            ncfCreate(host.factory(), kCLSID_GenericDocHandler, kIID_SaxDocumentHandler, document_),
            NCF_OK);
        EXPECT_EQ(ncfQuery(document_.inArg(), feeder_), NCF_OK);
        EXPECT_EQ(ncfQuery(document_.inArg(), errors_), NCF_OK);
    }
    void SetContainer() { EXPECT_EQ(feeder_->SetDataContainer(&container_), NCF_OK); }

    // Fires every event once; the results in order.
    std::vector<NCFRESULT> FireAll() {
        INCFString* const a = MakeHostString("a");
        INCFString* const b = MakeHostString("b");
        const std::vector<NCFRESULT> results{document_->End(), document_->Element(a),
                                             document_->Attribute(a, b), document_->Text(b)};
        a->Release();
        b->Release();
        return results;
    }

    FakeContainer container_;
    NCFSmartPtr<UTIL::INCFSaxDocumentHandler> document_;
    NCFSmartPtr<UTIL::INCFSaxErrorHandler> errors_;
    NCFSmartPtr<NMA::Impl::IGenericDocHandler> feeder_;
};

TEST_F(GenericDocHandlerTest, AnswersItsThreeInterfacesAndNoOther) {
    void* out = &container_;
    EXPECT_EQ(document_->QueryInterface(kIID_SaxParser, &out), NCF_E_NOINTERFACE);
    EXPECT_EQ(out, nullptr);
    NCFSmartPtr<INCFUnknown> fromDocument;
    NCFSmartPtr<INCFUnknown> fromFeeder;
    EXPECT_EQ(ncfQuery(document_.inArg(), fromDocument), NCF_OK);
    EXPECT_EQ(ncfQuery(feeder_.inArg(), fromFeeder), NCF_OK);
    EXPECT_EQ(fromDocument, fromFeeder);
}

TEST_F(GenericDocHandlerTest, NeedsAHost) {
    void* out = &container_;
    const ncfUInt32 before = GetObjectCount();
    EXPECT_EQ(CreateInstanceOf<NMA::Impl::GenericDocHandler>(nullptr, nullptr,
                                                             kIID_SaxDocumentHandler, &out),
              ncf_detail::Code(0x80000005));
    EXPECT_EQ(out, nullptr);
    EXPECT_EQ(GetObjectCount(), before);
}

TEST_F(GenericDocHandlerTest, StartFailsWithoutContainerAndDoesNotCallIt) {
    EXPECT_EQ(document_->Start(), ncf_detail::Code(0x80000008));
    SetContainer();
    EXPECT_EQ(document_->Start(), NCF_OK);
    EXPECT_TRUE(container_.calls.empty());
}

TEST_F(GenericDocHandlerTest, EventsWithoutContainerFailInsteadOfCrashing) {
    EXPECT_EQ(FireAll(), (std::vector<NCFRESULT>(4, NCF_E_FAIL)));
}

TEST_F(GenericDocHandlerTest, PassesEventsOnInUtf8) {
    SetContainer();
    INCFString* const text = MakeHostString("\xC3\xA9\xE5\x8B\x95");
    text->ConvertTo(kNCFUTF16);
    EXPECT_EQ(document_->Element(text), NCF_OK);
    EXPECT_EQ(document_->Attribute(text, text), NCF_OK);
    EXPECT_EQ(document_->Text(text), NCF_OK);
    EXPECT_EQ(document_->End(), NCF_OK);
    EXPECT_EQ(container_.calls,
              (std::vector<std::string>{"Element \xC3\xA9\xE5\x8B\x95",
                                        "Attribute \xC3\xA9\xE5\x8B\x95=\xC3\xA9\xE5\x8B\x95",
                                        "Text \xC3\xA9\xE5\x8B\x95", "End"}));
    text->Release();
}

TEST_F(GenericDocHandlerTest, AMissingTextIsAPointerFailure) {
    SetContainer();
    EXPECT_EQ(document_->Element(nullptr), NCF_E_POINTER);
    EXPECT_EQ(document_->Text(nullptr), NCF_E_POINTER);
    EXPECT_EQ(document_->Attribute(nullptr, nullptr), NCF_E_POINTER);
    EXPECT_TRUE(container_.calls.empty());
}

TEST_F(GenericDocHandlerTest, AThrownResultIsLoggedAndAnswered) {
    SetContainer();
    container_.throws = FakeContainer::Throw::kResult;
    EXPECT_EQ(FireAll(), (std::vector<NCFRESULT>(4, NCF_E_NOTFOUND)));
    const std::string text = "Received an NCFRESULT exception, err=0x8000000c, GenericDocHandler:";
    const std::vector<std::pair<std::string, std::string>> expected{
        {"NMA::Impl::GenericDocHandler::End", "73"},
        {"NMA::Impl::GenericDocHandler::Element", "110"},
        {"NMA::Impl::GenericDocHandler::Attribute", "149"},
        {"NMA::Impl::GenericDocHandler::Text", "184"}};
    ASSERT_EQ(log.records().size(), expected.size());
    for (std::size_t i = 0; i < expected.size(); ++i) {
        EXPECT_EQ(log.records()[i].where, expected[i].first);
        EXPECT_EQ(log.records()[i].text, expected[i].first + text + expected[i].second);
        EXPECT_EQ(log.records()[i].kind, 2u);
    }
}

TEST_F(GenericDocHandlerTest, AnythingElseThrownIsUnexpectedButPassesThroughAttribute) {
    SetContainer();
    container_.throws = FakeContainer::Throw::kOther;
    INCFString* const a = MakeHostString("a");
    EXPECT_EQ(document_->End(), NCF_E_UNEXPECTED);
    EXPECT_EQ(document_->Element(a), NCF_E_UNEXPECTED);
    EXPECT_EQ(document_->Text(a), NCF_E_UNEXPECTED);
    EXPECT_THROW(document_->Attribute(a, a), std::runtime_error);
    a->Release();
    const std::string text = "Received an unknown exception, GenericDocHandler:";
    ASSERT_EQ(log.records().size(), 3u);
    EXPECT_EQ(log.records()[0].text, "NMA::Impl::GenericDocHandler::End" + text + "73");
    EXPECT_EQ(log.records()[1].text, "NMA::Impl::GenericDocHandler::Element" + text + "110");
    EXPECT_EQ(log.records()[2].text, "NMA::Impl::GenericDocHandler::Text" + text + "184");
}

TEST_F(GenericDocHandlerTest, MessagesAreLoggedReleasedAndNeverStopAParse) {
    EXPECT_EQ(errors_->Warning(MakeHostString("100% odd")), NCF_OK);
    EXPECT_EQ(errors_->Error(MakeHostString("wrong")), NCF_OK);
    EXPECT_EQ(errors_->FatalError(MakeHostString("over")), NCF_OK);
    EXPECT_EQ(errors_->Warning(nullptr), NCF_OK);
    ASSERT_EQ(log.records().size(), 4u);
    EXPECT_EQ(log.records()[0].kind, 1u);
    EXPECT_EQ(log.records()[0].text, "NMA::Impl::GenericDocHandler::Warning100% odd");
    EXPECT_EQ(log.records()[1].kind, 2u);
    EXPECT_EQ(log.records()[1].text, "NMA::Impl::GenericDocHandler::Errorwrong");
    EXPECT_EQ(log.records()[2].kind, 2u);
    EXPECT_EQ(log.records()[2].where, "NMA::Impl::GenericDocHandler::FatalError");
}

TEST_F(GenericDocHandlerTest, TheMessageLosesTheReferenceThatItCameWith) {
    INCFString* const message = MakeHostString("text");
    message->AddRef();
    errors_->Error(message);
    EXPECT_EQ(message->Release(), 0u);
}

TEST_F(GenericDocHandlerTest, AMissingContainerIsRefusedUnderItsName) {
    EXPECT_EQ(feeder_->SetDataContainer(nullptr), NCF_E_INVALIDARG);
    EXPECT_TRUE(log.once("CHK_INARG(container)NMA::Impl::GenericDocHandler::SetDataContainer"));
}

TEST_F(GenericDocHandlerTest, SetDataContainerStandsAtTheFourthPlace) {
    void** const table = *reinterpret_cast<void***>(feeder_.inArg());
    using Set = NCFRESULT (*)(void*, XMLDataContainer*);
    EXPECT_EQ(reinterpret_cast<Set>(table[3])(feeder_.inArg(), &container_), NCF_OK);
    EXPECT_EQ(document_->Start(), NCF_OK);
}

}  // namespace
