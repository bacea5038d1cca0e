// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <optional>
#include <utility>

#include "reference_host/catalog/Catalog.h"
#include "reference_host/catalog/Schema.h"
#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/OutputFile.h"

namespace cliphost {

// Why a catalog can't be read or written, for people.
Failure CatalogFailure(const std::filesystem::path& file, const catalog::DatabaseError& error);
Failure CatalogFailure(const std::filesystem::path& file, const catalog::NoCatalog& error);

// Does what has to do with a catalog, whose errors become Failures.
template <class Work>
auto WithCatalog(const std::filesystem::path& file, const Work& work) -> decltype(work()) {
    try {
        return work();
    } catch (const catalog::DatabaseError& error) {
        throw CatalogFailure(file, error);
    } catch (const catalog::NoCatalog& error) {
        throw CatalogFailure(file, error);
    }
}

catalog::Catalog OpenCatalog(const std::filesystem::path& file, catalog::Catalog::For what);

// A catalog that takes the place of the one that may be there, once it is finished. What else is
// there is refused.
class NewCatalog {
public:
    explicit NewCatalog(const std::filesystem::path& file);  // throws a Failure

    catalog::Catalog& catalog() { return *catalog_; }
    // Whether there was one before.
    bool TakesPlace() const { return takesPlace_; }
    // Throws a Failure.
    void Finish();
    // The same, but what another run has put there in the meantime stays.
    void FinishIfFree();

private:
    std::filesystem::path file_;
    bool takesPlace_;
    OutputFile output_;
    std::optional<catalog::Catalog> catalog_;
};

}  // namespace cliphost
