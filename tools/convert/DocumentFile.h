/// An open document of MuPDF.
#pragma once

#include "tools/convert/ConvertOptions.h"
#include "tools/convert/FitzCall.h"

#include <string>
#include <vector>

namespace DrawmereConvert {

/// Owns a context of MuPDF, the document opened in it and the page loaded last.
class DocumentFile {
public:
    /// Throws: std::bad_alloc when there is no memory for a context.
    explicit DocumentFile(const ConvertOptions& options);
    DocumentFile(const DocumentFile&) = delete;
    DocumentFile& operator=(const DocumentFile&) = delete;
    ~DocumentFile();

    /// Throws: ConvertError.
    void open(const std::string& path, const std::string& password);

    /// Loads a page in place of the one before. Throws: ConvertError.
    void loadPage(int number);

    /// Returns: whether more memory was asked for than the limit allows.
    bool hasHitLimit() const { return budget.wasExceeded; }

    fz_context* ctx = nullptr;       // owned
    fz_document* document = nullptr; // owned
    fz_page* page = nullptr;         // owned
    int pageCount = 0;
    fz_rect pageBounds = fz_empty_rect;
    fz_cookie cookie{};                ///< of the drawing in progress
    std::vector<std::string> messages; ///< warnings and errors since they were taken last

private:
    struct MemoryBudget {
        std::size_t limit = 0; ///< 0 for none
        std::size_t used = 0;
        bool wasExceeded = false;
    };

    static void* allocate(void* budget, std::size_t size);
    static void* reallocate(void* budget, void* block, std::size_t size);
    static void release(void* budget, void* block);
    static void collectMessage(void* file, const char* message);

    void openDocument(const std::string& path);
    void authenticate(const std::string& password);
    void countPages();

    ConvertOptions options;
    MemoryBudget budget;
    fz_alloc_context allocator{};
};

} // namespace DrawmereConvert
