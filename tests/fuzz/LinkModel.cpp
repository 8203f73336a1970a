#include "tests/fuzz/LinkModel.h"

#include <algorithm>

namespace DrawmereTest {
namespace {

const std::string mark = "Mox-SVG-page-";

bool isInternal(const std::string& link) { return link.starts_with('#'); }

} // namespace

void LinkModel::draw(const LinkItem& item, Parts& parts) {
    switch (item.kind) {
    case LinkItem::PAGE:
        currentPage = item.page;
        firstPage = pageCount == 0 ? item.page : firstPage;
        ++pageCount;
        pageAnchors.clear();
        pageFiles.emplace(item.page, nameFile(item.page));
        parts.add({LinkItem::ANCHOR, mark + std::to_string(item.page)});
        break;
    case LinkItem::END_PAGE:
        for (const std::string& name : pageAnchors) {
            anchorPages.emplace(name, currentPage);
        }
        pageAnchors.clear();
        break;
    case LinkItem::ANCHOR:
    case LinkItem::VIEW:
        pageAnchors.insert(item.text);
        parts.add(item);
        break;
    case LinkItem::LINK:
        parts.open.push_back(parts.list.size());
        parts.list.push_back({item});
        break;
    case LinkItem::END_LINK:
        parts.list[parts.open.back()].push_back(item);
        parts.open.pop_back();
    }
}

void LinkModel::Parts::add(const LinkItem& item) {
    if (open.empty()) {
        list.push_back({item});
    } else {
        list[open.back()].push_back(item);
    }
}

void LinkModel::addDocument(const LinkItems& items) {
    Parts parts;
    for (const LinkItem& item : items) {
        draw(item, parts);
    }
    LinkItems document;
    for (const LinkItems& part : parts.list) {
        document.insert(document.end(), part.begin(), part.end());
    }
    keepOrWrite(document);
}

void LinkModel::keepOrWrite(const LinkItems& document) {
    const int page = std::exchange(currentPage, 0);
    const bool isWhole = std::ranges::all_of(document, [this](const LinkItem& item) {
        return item.kind != LinkItem::LINK || isSolved(item.text, /*isSingle=*/false);
    });
    currentPage = page;
    if (options.toStream || options.singleFile || !isWhole) {
        kept.emplace(page, document);
    } else {
        files[nameFile(page)] = document;
    }
}

bool LinkModel::isSolved(const std::string& link, bool isSingle) const {
    if (!isInternal(link) || isSingle) {
        return true;
    }
    const auto found = anchorPages.find(link.substr(1));
    return found != anchorPages.end() &&
           (found->second == currentPage || pageFiles.contains(found->second));
}

std::string LinkModel::getDestination(const std::string& link) const {
    if (!isInternal(link) || options.singleFile) {
        return link;
    }
    const int page = anchorPages.at(link.substr(1));
    return page == currentPage ? link : pageFiles.at(page);
}

void LinkModel::solve(LinkItems& document) {
    bool isAlone = false; // within a link that is left as it is with all that is in it
    for (LinkItem& item : document) {
        if (item.kind == LinkItem::LINK) {
            isAlone = !isSolved(item.text, options.singleFile);
            item.text = isAlone ? item.text : getDestination(item.text);
        }
        if (item.kind == LinkItem::END_LINK) {
            isAlone = false;
        }
        if (item.kind == LinkItem::ANCHOR && !isAlone && item.text.starts_with(mark)) {
            currentPage = std::stoi(item.text.substr(mark.size()));
            item.text = "p" + item.text.substr(mark.size());
        }
    }
}

std::map<std::string, LinkItems> LinkModel::finish() {
    currentPage = 0;
    for (auto& [page, document] : kept) {
        solve(document);
    }
    if (options.toStream || options.singleFile) {
        if (!kept.empty()) {
            files[options.toStream ? "stream" : "out.svg"] = kept.begin()->second;
        }
        return files;
    }
    for (const auto& [page, document] : kept) {
        files[nameFile(page)] = document;
    }
    const auto only = files.find(nameFile(firstPage));
    if (pageCount == 1 && !options.keepPageNumber && only != files.end()) {
        files["out.svg"] = only->second;
        files.erase(only);
    }
    return files;
}

} // namespace DrawmereTest
