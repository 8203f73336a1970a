#include "tools/convert/DocumentFile.h"

#include "tools/convert/ConvertError.h"
#include "tools/convert/SharedFile.h"

#include <algorithm>
#include <cstdlib>
#include <filesystem>
#include <new>

#include <malloc.h> // malloc_usable_size is no part of standard C++

namespace DrawmereConvert {
namespace {

constexpr std::size_t storeBytes = std::size_t{64} << 20U;
constexpr int maxPages = 1'000'000;
constexpr std::size_t maxMessages = 100; // a broken page can repeat itself without end

/// Returns: whether what reads the document goes on to read its file page by page. The others hold
/// all of it from the beginning, or look for further files beside it.
bool keepsFile(fz_context* ctx, const char* name) {
    const fz_document_handler* const handler = fz_recognize_document(ctx, name);
    for (const char* const kind : {".pdf", ".xps", ".epub", ".cbz"}) {
        if (handler == fz_recognize_document(ctx, kind)) {
            return true;
        }
    }
    return false;
}

/// Throws: ConvertError for what only says of itself that it can't be read as a document, or waits
/// for another program to write. What is not there is left for the reader to say.
void checkKind(const std::string& path) {
    namespace fs = std::filesystem;
    std::error_code failure;
    const fs::file_status status = fs::status(path, failure);
    if (!fs::exists(status)) {
        return;
    }
    if (!fs::is_regular_file(status)) {
        throw ConvertError(CONVERTERROR_UNREADABLE, fs::is_directory(status)
                                                        ? "it is a directory"
                                                        : "it is not a plain file");
    }
    if (fs::file_size(path, failure) == 0) {
        throw ConvertError(CONVERTERROR_UNREADABLE, "it is empty");
    }
}

fz_document* openShared(fz_context* ctx, const char* name) {
    if (!keepsFile(ctx, name)) {
        return fz_open_document(ctx, name);
    }
    fz_document* document = nullptr;
    fz_stream* const stream = openSharedFile(ctx, name);
    fz_try(ctx) { document = fz_open_document_with_stream(ctx, name, stream); }
    fz_always(ctx) { fz_drop_stream(ctx, stream); }
    fz_catch(ctx) { fz_rethrow(ctx); }
    return document;
}

} // namespace

DocumentFile::DocumentFile(const ConvertOptions& chosen) : options(chosen) {
    budget.limit = options.maxMemory;
    allocator = {&budget, &allocate, &reallocate, &release};
    ctx = fz_new_context(budget.limit > 0 ? &allocator : nullptr, nullptr, storeBytes);
    if (!ctx) {
        throw std::bad_alloc();
    }
    fz_set_warning_callback(ctx, &collectMessage, this);
    fz_set_error_callback(ctx, &collectMessage, this);
}

DocumentFile::~DocumentFile() {
    fz_drop_page(ctx, page);
    fz_drop_document(ctx, document);
    fz_drop_context(ctx);
}

void DocumentFile::open(const std::string& path, const std::string& password) {
    openDocument(path);
    authenticate(password);
    countPages();
}

void DocumentFile::openDocument(const std::string& path) {
    checkKind(path);
    const char* name = path.c_str();
    if (!callFitz(ctx, [&] {
            fz_register_document_handlers(ctx);
            document = openShared(ctx, name);
        })) {
        throw ConvertError(CONVERTERROR_UNREADABLE, takeFitzMessage(ctx));
    }
}

void DocumentFile::authenticate(const std::string& password) {
    const char* word = password.c_str();
    bool needed = false;
    bool accepted = false;
    if (!callFitz(ctx, [&] {
            needed = fz_needs_password(ctx, document) != 0;
            accepted = !needed || fz_authenticate_password(ctx, document, word) != 0;
        })) {
        throw ConvertError(CONVERTERROR_UNREADABLE, takeFitzMessage(ctx));
    }
    if (!accepted) {
        throw ConvertError(CONVERTERROR_PASSWORD,
                           password.empty() ? "a password is needed" : "the password is wrong");
    }
}

void DocumentFile::countPages() {
    const float width = options.layoutWidth;
    const float height = options.layoutHeight;
    const float em = options.layoutEm;
    if (!callFitz(ctx, [&] {
            if (fz_is_document_reflowable(ctx, document)) {
                fz_layout_document(ctx, document, width, height, em);
            }
            pageCount = fz_count_pages(ctx, document);
        })) {
        throw ConvertError(CONVERTERROR_UNREADABLE, takeFitzMessage(ctx));
    }
    if (pageCount < 1) {
        throw ConvertError(CONVERTERROR_NOPAGES, "there are no pages");
    }
    if (pageCount > maxPages) {
        throw ConvertError(CONVERTERROR_UNREADABLE,
                           "it claims to have " + std::to_string(pageCount) + " pages");
    }
}

void DocumentFile::loadPage(int number) {
    fz_drop_page(ctx, page);
    page = nullptr;
    cookie = {};
    if (!callFitz(ctx, [&] {
            page = fz_load_page(ctx, document, number);
            pageBounds = fz_bound_page(ctx, page);
        })) {
        throw ConvertError(CONVERTERROR_PAGE, takeFitzMessage(ctx));
    }
}

void DocumentFile::collectMessage(void* file, const char* message) {
    std::vector<std::string>& messages = static_cast<DocumentFile*>(file)->messages;
    try {
        if (messages.size() < maxMessages &&
            std::find(messages.begin(), messages.end(), message) == messages.end()) {
            messages.emplace_back(message);
        }
    } catch (...) { // NOLINT(bugprone-empty-catch): no exception may pass through MuPDF
    }
}

// A block counts as what the heap sets aside for it.

void* DocumentFile::allocate(void* budget, std::size_t size) {
    return reallocate(budget, nullptr, size);
}

void* DocumentFile::reallocate(void* budget, void* block, std::size_t size) {
    auto& account = *static_cast<MemoryBudget*>(budget);
    const std::size_t before = malloc_usable_size(block);
    if (account.used - before + size > account.limit) {
        account.wasExceeded = true;
        return nullptr;
    }
    void* fresh = std::realloc(block, size);
    if (fresh) {
        account.used = account.used - before + malloc_usable_size(fresh);
    }
    return fresh;
}

void DocumentFile::release(void* budget, void* block) {
    static_cast<MemoryBudget*>(budget)->used -= malloc_usable_size(block);
    std::free(block);
}

} // namespace DrawmereConvert
