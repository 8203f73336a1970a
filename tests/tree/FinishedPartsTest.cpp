// What is finished is packed, and nobody notices.
#include "draw/DrawmereImpl.h"
#include "state/SVGGroupManager.h"
#include "tests/frontend/RunFiles.h"
#include "tree/SVGTreeManager.h"

#include <gtest/gtest.h>
#include <map>

namespace DrawmereTest {
namespace {

class FinishedParts : public testing::Test {
protected:
    FinishedParts() {
        run.open();
        run.drawmere.startPage(1, MoxRectT<MoxLength>(pt(0), pt(0), pt(100), pt(100)));
        tree = run.drawmere.impl->treeManager;
    }

    void drawRects(int count) {
        for (int i = 1; i <= count; ++i) {
            run.drawmere.drawRect(pt(1), pt(2), pt(static_cast<float>(i)), pt(4), pt(0), pt(0),
                                  PAINTMODE_FILL);
        }
    }

    /// Returns: how many nodes of each kind there are in the open document.
    std::map<int, int> countNodes() const {
        std::map<int, int> counts;
        const MoxNode* const root = tree->document.get();
        for (const MoxNode* node = root; node; node = node->followingLink(root)) {
            ++counts[node->kindLink()];
        }
        return counts;
    }

    /// Returns: the document when it is finished.
    std::string finish() {
        run.drawmere.endPage();
        run.drawmere.finishRootSvg();
        run.drawmere.finish();
        return run.directory.read("out.svg");
    }

    RunFiles run;
    SVGTreeManager* tree; // borrowed
};

TEST_F(FinishedParts, AreBytesInTheTree) {
    drawRects(100);
    run.drawmere.pushState(); // closes the group
    drawRects(100);
    std::map<int, int> counts = countNodes();
    EXPECT_LT(counts[MoxCommonNS::MOXNODE_ELEMENT], 15);
    EXPECT_EQ(counts[MoxCommonNS::MOXNODE_PACKED], 1);
    EXPECT_EQ(tree->document->getDocumentElement()->lastLink()->kindLink(),
              MoxCommonNS::MOXNODE_ELEMENT);
}

TEST_F(FinishedParts, AreNodesForWhoAsksForTheDocument) {
    drawRects(100);
    run.drawmere.pushState();
    ASSERT_GT(countNodes()[MoxCommonNS::MOXNODE_PACKED], 0);
    run.drawmere.impl->getDocument();
    drawRects(100);
    EXPECT_EQ(countNodes()[MoxCommonNS::MOXNODE_PACKED], 0);
    EXPECT_GT(countNodes()[MoxCommonNS::MOXNODE_ELEMENT], 100);
}

TEST_F(FinishedParts, AreNodesInTheOpenGroupToo) {
    drawRects(100);
    const MoxNode* const group = run.drawmere.impl->groupManager->getGroupRootNode();
    ASSERT_EQ(group->lastLink()->previousLink()->kindLink(), MoxCommonNS::MOXNODE_PACKED);
    run.drawmere.startPathData();
    run.drawmere.impl->getDocument();
    EXPECT_EQ(group->lastLink()->previousLink()->kindLink(), MoxCommonNS::MOXNODE_ELEMENT);
}

TEST_F(FinishedParts, StayNodesInTheSmallDeviceMode) {
    run.config.svgType = SVGConfig::SVGTYPE_TINY;
    run.config.wispMode = true;
    run.open();
    tree = run.drawmere.impl->treeManager;
    drawRects(100);
    run.drawmere.pushState();
    EXPECT_GT(countNodes()[MoxCommonNS::MOXNODE_ELEMENT], 100);
}

TEST_F(FinishedParts, LeaveLinksAndDestinationsToBeFound) {
    drawRects(5);
    run.drawmere.startLink(u"#Mox", MoxName());
    drawRects(5);
    run.drawmere.endLink();
    run.drawmere.pushState();
    run.drawmere.setInternalLinkAnchor(u"here", 0, 0);
    drawRects(5);
    run.drawmere.popState();
    drawRects(5);
    int links = 0;
    int destinations = 0;
    const MoxNode* const root = tree->document.get();
    for (const MoxNode* node = root; node; node = node->followingLink(root)) {
        if (node->kindLink() == MoxCommonNS::MOXNODE_ELEMENT) {
            const auto& element = static_cast<const MoxElement&>(*node);
            links += element.localLink() == MoxName(SVGName(SVGName::a)) ? 1 : 0;
            destinations += element.hasAttribute(SVGName(SVGName::id)) ? 1 : 0;
        }
    }
    EXPECT_EQ(links, 1);
    EXPECT_EQ(destinations, 2); // the page and "here"
}

TEST_F(FinishedParts, AreBytesBetweenLinksToo) {
    for (int i = 0; i < 50; ++i) {
        drawRects(5);
        run.drawmere.startLink(u"#Mox", MoxName());
        run.drawmere.endLink();
    }
    EXPECT_LT(countNodes()[MoxCommonNS::MOXNODE_ELEMENT], 70); // the links and a little
}

TEST_F(FinishedParts, AreWhatTheyWereWhenTheyAreWritten) {
    drawRects(3);
    run.drawmere.setFillColor(MoxColor(1, 2, 3)); // of what comes, not of what is finished
    drawRects(1);
    const std::string document = finish();
    EXPECT_NE(document.find("<rect x=\"1\" y=\"2\" width=\"1\" height=\"4\" fill=\"none\"/>"
                            "<rect x=\"1\" y=\"2\" width=\"2\" height=\"4\" fill=\"none\"/>"
                            "<rect x=\"1\" y=\"2\" width=\"3\" height=\"4\" fill=\"none\"/>"
                            "<rect x=\"1\" y=\"2\" width=\"1\" height=\"4\" "
                            "fill=\"#010203\"/></g></svg>"),
              std::string::npos)
        << document;
}

} // namespace
} // namespace DrawmereTest
