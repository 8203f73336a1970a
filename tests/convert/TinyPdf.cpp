#include "tests/convert/TinyPdf.h"

namespace DrawmereTest {
namespace {

// Each of these forms draws the next ten times.
constexpr int formCount = 14;
constexpr int firstForm = 3;
constexpr int firstPage = firstForm + formCount;

/// Collects the objects of a file and where each begins.
class ObjectWriter {
public:
    void add(const std::string& dictionary) { begin() += dictionary + "\nendobj\n"; }

    void addStream(const std::string& entries, const std::string& content) {
        add("<<" + entries + "/Length " + std::to_string(content.size()) + ">>\nstream\n" +
            content + "\nendstream");
    }

    std::string finish() {
        const std::string start = std::to_string(bytes.size());
        const std::string count = std::to_string(places.size() + 1);
        bytes += "xref\n0 " + count + "\n0000000000 65535 f \n";
        for (const std::size_t place : places) {
            const std::string digits = std::to_string(place);
            bytes += std::string(10 - digits.size(), '0') + digits + " 00000 n \n";
        }
        return bytes + "trailer\n<</Root 1 0 R/Size " + count + ">>\nstartxref\n" + start +
               "\n%%EOF\n";
    }

private:
    std::string& begin() {
        places.push_back(bytes.size());
        return bytes += std::to_string(places.size()) + " 0 obj\n";
    }

    std::string bytes = "%PDF-1.4\n";
    std::vector<std::size_t> places;
};

std::string refer(int number) { return std::to_string(number) + " 0 R"; }

void addForms(ObjectWriter& file) {
    for (int i = 0; i < formCount; ++i) {
        const bool isLast = i + 1 == formCount;
        std::string content = isLast ? "0 0 1 1 re f" : "";
        std::string entries = "/Type/XObject/Subtype/Form/BBox[0 0 200 100]";
        if (!isLast) {
            entries += "/Resources<</XObject<</F " + refer(firstForm + i + 1) + ">>>>";
            for (int n = 0; n < 10; ++n) {
                content += "/F Do ";
            }
        }
        file.addStream(entries, content);
    }
}

} // namespace

TinyPdf& TinyPdf::addPage(const std::string& content, const std::string& extra) {
    pages.push_back({content, extra});
    return *this;
}

TinyPdf& TinyPdf::addPlainPage() {
    const std::string size = std::to_string(10 + pages.size());
    return addPage("10 10 " + size + " " + size + " re f");
}

TinyPdf& TinyPdf::addLinkPage(int target) {
    return addPage("10 10 80 20 re f",
                   "/Annots[<</Type/Annot/Subtype/Link/Rect[10 10 90 30]/Border[0 0 0]/Dest[" +
                       refer(firstPage + 2 * target) + "/Fit]>>]");
}

TinyPdf& TinyPdf::addEndlessPage() { return addPage("/F Do"); }

std::string TinyPdf::write() const {
    ObjectWriter file;
    file.add("<</Type/Catalog/Pages 2 0 R>>");
    std::string kids;
    for (std::size_t i = 0; i < pages.size(); ++i) {
        kids += refer(firstPage + 2 * static_cast<int>(i)) + " ";
    }
    file.add("<</Type/Pages/Kids[" + kids + "]/Count " + std::to_string(pages.size()) +
             "/MediaBox[0 0 200 100]/Resources<</XObject<</F " + refer(firstForm) + ">>>>>>");
    addForms(file);
    int number = firstPage;
    for (const Page& page : pages) {
        file.add("<</Type/Page/Parent 2 0 R/Contents " + refer(number + 1) + page.extra + ">>");
        file.addStream("", page.content);
        number += 2;
    }
    return file.finish();
}

std::string makePlainPdf(int pageCount) {
    TinyPdf file;
    for (int i = 0; i < pageCount; ++i) {
        file.addPlainPage();
    }
    return file.write();
}

} // namespace DrawmereTest
