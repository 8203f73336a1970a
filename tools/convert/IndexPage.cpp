#include "tools/convert/IndexPage.h"

#include "tools/convert/IndexTemplate.h"
#include "tools/convert/LinkReader.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <map>
#include <string_view>

namespace DrawmereConvert {
namespace {

struct Escape {
    char sign;
    const char* text;
};

constexpr std::array<Escape, 3> escapes = {{{'&', "&amp;"}, {'<', "&lt;"}, {'"', "&quot;"}}};

std::string escape(std::string_view text) {
    std::string escaped;
    for (const char sign : text) {
        const auto* const found = std::ranges::find(escapes, sign, &Escape::sign);
        escaped += found == escapes.end() ? std::string(1, sign) : found->text;
    }
    return escaped;
}

/// Returns: at most two digits behind the point.
std::string toText(float number) {
    std::array<char, 64> digits{};
    const auto end = std::to_chars(digits.data(), digits.data() + digits.size(), number,
                                   std::chars_format::fixed, 2);
    std::string text(digits.data(), end.ptr);
    text.erase(text.find_last_not_of('0') + 1);
    return text.ends_with('.') ? text.substr(0, text.size() - 1) : text;
}

std::string toPercent(float part, float whole) {
    return toText(whole > 0 ? 100 * part / whole : 0) + "%";
}

/// Writes the page, part by part.
class IndexWriter {
public:
    explicit IndexWriter(const std::vector<IndexDocument>& allDocuments) : documents(allDocuments) {
        for (const IndexDocument& document : documents) {
            for (const IndexEntry& entry : document.entries) {
                numbers.emplace(entry.file, ++pageCount);
            }
        }
        hasOutline = documents.size() > 1 || !documents.front().outline.empty();
    }

    std::string write() {
        writeHead();
        writeHeader();
        if (hasOutline) {
            writeOutline();
        }
        html += "<main tabindex=\"0\" aria-label=\"Pages\">\n";
        for (const IndexDocument& document : documents) {
            for (const IndexEntry& entry : document.entries) {
                writePage(entry);
            }
        }
        writeFallback();
        html += std::string("</main>\n<script>") + indexScript + "</script>\n</body>\n</html>\n";
        return html;
    }

private:
    void writeHead() {
        html = "<!DOCTYPE html>\n<html lang=\"en\">\n<head>\n<meta charset=\"utf-8\">\n";
        html += std::string(indexMark) + "\n";
        html += "<meta name=\"viewport\" content=\"width=device-width\">\n";
        html += "<title>" + escape(documents.front().title) + "</title>\n";
        html += std::string("<style>") + indexStyle + makePaper() + "</style>\n</head>\n";
        html += hasOutline ? "<body class=\"outline\">\n" : "<body>\n";
    }

    /// Returns: the style that prints each page on a sheet, of the size of the largest.
    std::string makePaper() const {
        PageSize paper;
        for (const IndexDocument& document : documents) {
            for (const IndexEntry& entry : document.entries) {
                paper.width = std::max(paper.width, entry.size.width);
                paper.height = std::max(paper.height, entry.size.height);
            }
        }
        return "@page { margin: 0; size: " + toText(paper.width) + "pt " + toText(paper.height) +
               "pt; }\n";
    }

    void writeButton(const char* id, const char* name, const char* key, const char* label,
                     const char* more = "") {
        html += std::string("<button id=\"") + id + "\" title=\"" + name + " (" + key +
                ")\" aria-label=\"" + name + "\"" + more + ">" + label + "</button>\n";
    }

    void writeHeader() {
        html += "<header>\n";
        if (hasOutline) {
            writeButton("outline", "Outline", "o", "&#9776;", " aria-expanded=\"true\"");
        }
        writeButton("previous", "Previous page", "left", "&#9664;");
        html +=
            "<input id=\"number\" type=\"number\" min=\"1\" value=\"1\" aria-label=\"Page\" max=\"" +
            std::to_string(pageCount) + "\"> / " + std::to_string(pageCount) + "\n";
        writeButton("next", "Next page", "right", "&#9654;");
        html += "<span class=\"space\"></span>\n";
        writeButton("smaller", "Smaller", "-", "&minus;");
        writeButton("zoom", "Full size", "0", "100 %");
        writeButton("larger", "Larger", "+", "+");
        writeButton("fit", "Fit to the width", "w", "&harr;");
        writeButton("print", "Print all pages", "Ctrl+P", "Print");
        html += "</header>\n";
    }

    void writeOutline() {
        html += "<nav aria-label=\"Outline\">\n";
        for (const IndexDocument& document : documents) {
            depth = 0;
            language = document.language;
            if (documents.size() > 1) {
                const bool isEmpty = document.entries.empty();
                writeOutlineEntry(document.title, 0,
                                  isEmpty ? 0 : numbers.at(document.entries.front().file));
            }
            const int base = documents.size() > 1 ? 1 : 0;
            for (const OutlineEntry& entry : document.outline) {
                writeOutlineEntry(entry.title, base + entry.level, findPage(document, entry.page));
            }
            setDepth(0);
        }
        html += "</nav>\n";
    }

    /// Returns: the number of the page in the index, 0 when it is not there.
    int findPage(const IndexDocument& document, int page) const {
        const auto found = std::ranges::find(document.entries, page, &IndexEntry::page);
        return page < 0 || found == document.entries.end() ? 0 : numbers.at(found->file);
    }

    void writeOutlineEntry(const std::string& title, int level, int number) {
        setDepth(level + 1);
        if (number > 0) {
            html += "<li><a href=\"#p" + std::to_string(number) + "\">" + escape(title) + "</a>\n";
        } else {
            html += "<li><span>" + escape(title) + "</span>\n";
        }
    }

    /// Opens or closes lists. The end of an item need not be written in HTML.
    void setDepth(int wanted) {
        for (; depth < wanted; ++depth) {
            const bool isInLanguage = depth == 0 && !language.empty();
            html += isInLanguage ? "<ul lang=\"" + escape(language) + "\">\n" : "<ul>\n";
        }
        for (; depth > wanted; --depth) {
            html += "</ul>\n";
        }
    }

    void writePage(const IndexEntry& entry) {
        const std::string number = std::to_string(numbers.at(entry.file));
        html += "<section id=\"p" + number + "\" role=\"group\" aria-label=\"Page " + number +
                "\" style=\"--w:" + toText(entry.size.width) + ";--h:" + toText(entry.size.height) +
                "\" data-file=\"" + escape(entry.file) + "\">\n";
        for (const IndexAnchor& anchor : entry.anchors) {
            html += "<i id=\"p" + number + "." + escape(anchor.id) +
                    "\" style=\"top:" + toPercent(anchor.y, entry.size.height) + "\"></i>\n";
        }
        for (const LinkArea& link : entry.links) {
            writeLink(entry, link);
        }
        html += "</section>\n";
    }

    /// For readers without scripts.
    void writeFallback() {
        html += "<noscript><ol>\n";
        for (const IndexDocument& document : documents) {
            for (const IndexEntry& entry : document.entries) {
                html += "<li><a href=\"" + escape(entry.file) + "\">" + escape(document.title) +
                        ", page " + std::to_string(entry.page + 1) + "</a>\n";
            }
        }
        html += "</ol></noscript>\n";
    }

    void writeLink(const IndexEntry& entry, const LinkArea& link) {
        const std::string target = findTarget(entry, link.target);
        if (target.empty()) {
            return;
        }
        html += "<a href=\"" + escape(target) +
                (target.front() == '#' ? "\"" : "\" target=\"_blank\" rel=\"noopener\"") +
                " style=\"left:" + toPercent(link.x, entry.size.width) +
                ";top:" + toPercent(link.y, entry.size.height) +
                ";width:" + toPercent(link.width, entry.size.width) +
                ";height:" + toPercent(link.height, entry.size.height) + "\" aria-label=\"" +
                escape(describeTarget(target)) + "\"></a>\n";
    }

    /// Returns: what a link is called that has no text of its own.
    static std::string describeTarget(const std::string& target) {
        return target.starts_with("#p") ? "Page " + target.substr(2, target.find('.') - 2) : target;
    }

    /// Returns: where a link of a page leads in the index, or outside of it; nothing when a reader
    /// may not be led there.
    std::string findTarget(const IndexEntry& entry, const std::string& target) const {
        const std::size_t hash = target.find('#');
        const std::string file = hash == 0 ? entry.file : target.substr(0, hash);
        const auto found = numbers.find(file);
        if (found == numbers.end()) {
            return leadsToPlace(target) ? target : std::string();
        }
        const std::string page = "#p" + std::to_string(found->second);
        return hash == std::string::npos ? page : page + "." + target.substr(hash + 1);
    }

    const std::vector<IndexDocument>& documents;
    std::map<std::string, int> numbers; // of pages in the index, from 1, by their files
    int pageCount = 0;
    bool hasOutline = false;
    int depth = 0;        // of open lists
    std::string language; // of the outline in hand
    std::string html;
};

} // namespace

std::string makeIndexPage(const std::vector<IndexDocument>& documents) {
    return documents.empty() ? std::string() : IndexWriter(documents).write();
}

bool isIndexPage(const std::string& bytes) { return bytes.find(indexMark) != std::string::npos; }

} // namespace DrawmereConvert
