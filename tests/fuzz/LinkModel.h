/// What the links of a run lead to, found out in the plainest way.
#pragma once

#include <map>
#include <set>
#include <string>
#include <utility>
#include <vector>

namespace DrawmereTest {

/// One thing that is drawn, or that stands in a document.
struct LinkItem {
    enum Kind { PAGE, END_PAGE, ANCHOR, VIEW, LINK, END_LINK };

    bool operator==(const LinkItem&) const = default;

    Kind kind = PAGE;
    std::string text; ///< the name of a destination, or where a link leads
    int page = 0;     ///< of PAGE
};

using LinkItems = std::vector<LinkItem>;

/// How the documents of a run are written.
struct LinkOptions {
    bool toStream = false;
    bool singleFile = false;
    bool keepPageNumber = false;
};

/// Takes the documents of a run and tells what the files hold in the end. Items of a document are
/// anchors, views, links and their ends; the stream is a file called "stream".
class LinkModel {
public:
    explicit LinkModel(const LinkOptions& runOptions) : options(runOptions) {}

    void addDocument(const LinkItems& items);

    /// Ends the run. Returns: what each file holds.
    std::map<std::string, LinkItems> finish();

    /// Returns: the name of the file of a page.
    static std::string nameFile(int page) { return "out" + std::to_string(page) + ".svg"; }

private:
    /// The children of a document's root. A link is one, wherever it is begun.
    struct Parts {
        void add(const LinkItem& item);

        std::vector<LinkItems> list;
        std::vector<std::size_t> open; // links
    };

    void draw(const LinkItem& item, Parts& parts);
    void keepOrWrite(const LinkItems& document);
    bool isSolved(const std::string& link, bool isSingle) const;
    std::string getDestination(const std::string& link) const;
    void solve(LinkItems& document);

    LinkOptions options;
    int pageCount = 0;
    int firstPage = 0;
    int currentPage = 0; // of the drawing, later of the solving
    std::set<std::string> pageAnchors;
    std::map<std::string, int> anchorPages;
    std::map<int, std::string> pageFiles;
    std::map<int, LinkItems> kept;
    std::map<std::string, LinkItems> files;
};

} // namespace DrawmereTest
