// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <gtest/gtest.h>

#include <tuple>
#include <type_traits>

#include "aaf_library/model/ClassDefinition.h"
#include "aaf_library/model/Dictionary.h"
#include "aaf_library/model/Model.h"
#include "aaf_library/model/TypeDefinition.h"
#include "host_interfaces/aaf/AAF.h"
#include "host_interfaces/aaf/AAFClassIds.h"
#include "host_interfaces/aaf/AAFDefinitionIds.h"
#include "host_interfaces/aaf/AAFTypeIds.h"
#include "tests/unit/aaf_library/Get.h"

// A model of its own for each test, seen through the published interfaces. The
// classes of other rooms are not there, so their objects answer IAAFObject only.
class ModelFixture : public testing::Test {
protected:
    template <class I>
    using Ptr = aaf::RefPtr<I>;

    static const aaf::ClassRegistry& Registry() {
        static const aaf::ClassRegistry registry;
        return registry;
    }

    aaf::RefPtr<aaf::Model> model = aaf::Model::Create(Registry());
    IAAFDictionary* dictionary = &model->dictionary();

    // What an operation gives whose last argument is an interface output.
    template <class Object, class Interface, class... Parameters, class... Given>
    static auto Out(const Object& object, HRESULT (Interface::*operation)(Parameters...),
                    Given... given) {
        using Last = std::tuple_element_t<sizeof...(Given), std::tuple<Parameters...>>;
        using I = std::remove_pointer_t<std::remove_pointer_t<Last>>;
        I* out = nullptr;
        EXPECT_EQ(((*object).*operation)(given..., &out), AAFRESULT_SUCCESS);
        return Ptr<I>::Adopt(out);
    }
    template <class I, class Call>
    static Ptr<I> Out(Call call) {
        I* out = nullptr;
        EXPECT_EQ(call(&out), AAFRESULT_SUCCESS);
        return Ptr<I>::Adopt(out);
    }

    template <class I, class From>
    static Ptr<I> As(const Ptr<From>& from) {
        return Out<I>([&](I** out) {
            return from->QueryInterface(aafIdOf(static_cast<const I*>(nullptr)),
                                        reinterpret_cast<void**>(out));
        });
    }

    Ptr<IAAFTypeDef> Type(const aafUID_t& id) {
        return Out(dictionary, &IAAFDictionary::LookupTypeDef, id);
    }
    template <class I>
    Ptr<I> TypeAs(const aafUID_t& id) {
        return As<I>(Type(id));
    }

    Ptr<IAAFClassDef> Class(const aafUID_t& id) {
        return Out(dictionary, &IAAFDictionary::LookupClassDef, id);
    }
    Ptr<IAAFPropertyDef> PropertyOf(const aafUID_t& classId, const aafUID_t& id) {
        return Out(Class(classId), &IAAFClassDef::LookupPropertyDef, id);
    }

    Ptr<IAAFObject> New(const aafUID_t& classId) {
        IUnknown* made = nullptr;
        EXPECT_EQ(dictionary->CreateInstance(classId, IID_IAAFObject, &made), AAFRESULT_SUCCESS);
        return Ptr<IAAFObject>::Adopt(static_cast<IAAFObject*>(static_cast<void*>(made)));
    }
    template <class I>
    Ptr<I> NewMeta(const aafUID_t& classId) {
        IUnknown* made = nullptr;
        EXPECT_EQ(
            dictionary->CreateMetaInstance(classId, aafIdOf(static_cast<const I*>(nullptr)), &made),
            AAFRESULT_SUCCESS);
        return Ptr<I>::Adopt(static_cast<I*>(static_cast<void*>(made)));
    }

    Ptr<IAAFPropertyValue> Int32Value(aafInt32 number) {
        const auto type = TypeAs<IAAFTypeDefInt>(kAAFTypeID_Int32);
        return Out(type, &IAAFTypeDefInt::CreateValue, reinterpret_cast<aafMemPtr_t>(&number),
                   sizeof number);
    }
    aafInt32 NumberOf(const Ptr<IAAFPropertyValue>& value) {
        aafInt32 number = -1;
        EXPECT_EQ(TypeAs<IAAFTypeDefInt>(kAAFTypeID_Int32)
                      ->GetInteger(value.get(), reinterpret_cast<aafMemPtr_t>(&number), 4),
                  AAFRESULT_SUCCESS);
        return number;
    }

    template <class I>
    static ULONG CountOf(const Ptr<I>& pointer) {
        pointer->AddRef();
        return pointer->Release();
    }
};

// An id that nothing built in has.
inline constexpr aafUID_t kOwnId = ncfGuid("11111111-2222-3333-4444-555555555555");
inline constexpr aafUID_t kOtherOwnId = ncfGuid("11111111-2222-3333-4444-666666666666");
