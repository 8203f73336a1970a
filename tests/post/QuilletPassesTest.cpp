// One walk does what the passes do one after the other.
#include "post/QuilletExtention.h"

#include "tests/post/Quillet.h"
#include "tests/post/ReadTree.h"

#include <random>

namespace DrawmereTest {
namespace {

/// Writes trees that hold all the passes look for, at all depths, the same for each number.
class TreeMaker {
public:
    explicit TreeMaker(unsigned seed) : random(seed) {}

    std::string makeRoot() {
        std::string content;
        while (!oneIn(6)) {
            content += makeNode(0);
        }
        return "<svg xmlns:xlink=\"http://www.w3.org/1999/xlink\">" + content + "</svg>";
    }

private:
    std::string makeNode(int depth) {
        static const char* const tags[] = {"g",    "a",     "a",   "text",  "text", "defs",
                                           "defs", "image", "svg", "tspan", "rect", "use"};
        if (oneIn(6)) {
            return pick({"t", "uv", "xyz", "\U0001F600"});
        }
        if (oneIn(6)) {
            return "<svg" + makeAttributes() + "><use xlink:href=\"#" + pick({"i", "j"}) +
                   "\"/></svg>";
        }
        const std::string tag = tags[random() % std::size(tags)];
        std::string content;
        while (depth < 4 && !oneIn(3)) {
            content += makeNode(depth + 1);
        }
        return "<" + tag + makeAttributes() + ">" + content + "</" + tag + ">";
    }

    std::string makeAttributes() {
        std::string text;
        const auto add = [&](const std::string& name, std::initializer_list<const char*> values) {
            if (oneIn(3)) {
                text += " " + name + "=\"" + pick(values) + "\"";
            }
        };
        add("id", {"i", "j", "k"});
        add("x", {"", "1", "1 2", "1 2 3", "1 ", " "});
        add("y", {"", "4", "4 5", "4  5"});
        add("rotate", {"", "0", "30", "30 0 60"});
        add("fill", {"none", "red", "#F00", "#123456", "url(#p)", "transparent", ""});
        add("stroke", {"none", "blue", "rgb(1,2,3)"});
        add("transform", {"scale(2)"});
        add("xlink:href", {"data:0", "#i"});
        return text;
    }

    std::string pick(std::initializer_list<const char*> values) {
        return values.begin()[random() % values.size()];
    }

    bool oneIn(unsigned count) { return random() % count == 0; }

    std::mt19937 random;
};

TEST(QuilletPasses, AllTogetherDoWhatEachDoesByItself) {
    int changed = 0;
    for (unsigned seed = 0; seed < 400; ++seed) {
        const std::string xml = TreeMaker(seed).makeRoot();
        const MoxPtr<SVGDocument> together = readTree(xml);
        makeQuillet().optimizeQuillet(together->getDocumentElement());
        const MoxPtr<SVGDocument> apart = readTree(xml);
        MoxElement* const root = apart->getDocumentElement();
        QuilletExtention quillet = makeQuillet();
        quillet.removeAElement(root);
        quillet.textCoordinate(root);
        quillet.embedImageDirect(root);
        quillet.setRGBColor(root);
        const std::string expected = writeTree(*apart);
        ASSERT_EQ(writeTree(*together), expected) << xml;
        changed += expected == writeTree(*readTree(xml)) ? 0 : 1;
    }
    EXPECT_GT(changed, 250);
}

TEST(QuilletPasses, TextOfAnyLengthIsSplit) {
    constexpr int length = 100'000;
    const MoxPtr<SVGDocument> document =
        readTree("<svg><text x=\"1 2\" rotate=\"3 4\" fill=\"red\">" + std::string(length, 'a') +
                 "</text></svg>");
    const MoxElement* const root = document->getDocumentElement();
    makeQuillet().optimizeQuillet(document->getDocumentElement());
    int count = 0;
    for (const MoxNode* text = root->getFirstChild(); text; text = text->getNextSibling()) {
        ++count;
    }
    EXPECT_EQ(count, length);
}

TEST(QuilletPasses, TextsInTextsAreNoMatterOfTheStack) {
    const MoxPtr<SVGDocument> document = readTree("<svg><text x=\"1 2\">ab</text></svg>");
    MoxElement* const root = document->getDocumentElement();
    MoxNode* deepest = root->getFirstChild();
    for (const char* name : {"text", "a", "defs"}) {
        for (int i = 0; i < 100'000; ++i) {
            deepest = deepest->appendChild(document->createElement(toName(name)).get());
        }
    }
    makeQuillet().optimizeQuillet(root);
    EXPECT_EQ(writeTree(*document),
              R"(<svg><text x="1" y="0">a</text><text x="2" y="0">b</text></svg>)");
}

} // namespace
} // namespace DrawmereTest
