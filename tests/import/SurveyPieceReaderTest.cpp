#include "import/SurveyPieceReader.h"

#include <gtest/gtest.h>

#include <random>
#include <string>
#include <vector>

#include "tests/import/SurveyReference.h"

namespace {

using Pieces = std::vector<std::string>;

Pieces ReadPieces(const std::string& bytes, size_t nBlock) {
    std::FILE* pFile = std::tmpfile();
    if (pFile == nullptr) {
        ADD_FAILURE() << "no temporary file";
        return {};
    }
    std::fwrite(bytes.data(), 1, bytes.size(), pFile);
    std::rewind(pFile);
    CSurveyPieceReader reader(pFile, nBlock);
    Pieces pieces;
    for (std::string_view piece; reader.Next(piece);) {
        pieces.emplace_back(piece);
    }
    std::fclose(pFile);
    return pieces;
}

// The reference's pieces without line ends and without the empty ones, which the reader skips.
Pieces ReferencePieces(const std::string& bytes) {
    Pieces pieces;
    for (std::string piece : survey_reference::Pieces(bytes)) {
        if (!piece.empty() && piece.back() == '\n') {
            piece.pop_back();
        }
        if (!piece.empty()) {
            pieces.push_back(piece);
        }
    }
    return pieces;
}

std::string X(size_t n) {
    return std::string(n, 'x');
}

TEST(SurveyPieceReader, CutsAsFgetsOnATextModeStream) {
    const struct {
        std::string bytes;
        Pieces pieces;
    } cases[] = {
        {"", {}},
        {"\n\n\r\n", {}},
        {"abc\r\ndef", {"abc", "def"}},
        {"a\rb\n", {"a\rb"}},  // a lone CR is an ordinary character
        {"abc\r", {"abc\r"}},
        {"\r\r\n", {"\r"}},  // only the CR right before the LF goes
        {X(300) + "\n", {X(254), X(46)}},
        {X(254) + "\r\ny", {X(254), "y"}},  // the CR goes before the line is cut
        {X(255) + "\r\n", {X(254), "x"}},
        {X(253) + "\r" + X(3), {X(253) + "\r", X(3)}},
        {X(509) + "\n", {X(254), X(254), "x"}},
        {std::string("ab\0cd\nef", 8), {"ab", "ef"}},  // a NUL ends the C string
        {"ab\x1a"
         "cd\n",
         {"ab"}},  // Ctrl-Z ends the text
        {"a\r\x1a\n", {"a\r"}},
    };
    // Block sizes around the piece length and the carried remainder, and the default.
    const size_t blocks[] = {1, 2, 7, 253, 254, 255, 509, CSurveyPieceReader::kDefaultBlockBytes};
    for (size_t i = 0; i < std::size(cases); ++i) {
        EXPECT_EQ(ReferencePieces(cases[i].bytes), cases[i].pieces) << "case " << i;
        for (size_t nBlock : blocks) {
            EXPECT_EQ(ReadPieces(cases[i].bytes, nBlock), cases[i].pieces)
                << "case " << i << ", block " << nBlock;
        }
    }
}

TEST(SurveyPieceReader, AgreesWithTheReferenceOnRandomText) {
    // Few distinct bytes, so that line ends, CR LF pairs and NULs fall on every position relative
    // to pieces and blocks; every other round has long lines and rare specials.
    const char alphabet[] = {'x', 'x', ' ', '\r', '\n', '\0', '\x1a'};
    std::mt19937 random(12345);
    for (int round = 0; round < 300; ++round) {
        std::string bytes;
        for (size_t k = random() % 2000; k > 0; --k) {
            const bool bPlain = round % 2 == 0 && random() % 64 != 0;
            const char ch = bPlain ? 'x' : alphabet[random() % std::size(alphabet)];
            bytes += ch == '\x1a' && random() % 8 != 0 ? 'x' : ch;  // Ctrl-Z ends it: keep rare
        }
        const Pieces expected = ReferencePieces(bytes);
        for (size_t nBlock : {1, 5, 254, 255, 1000}) {
            ASSERT_EQ(ReadPieces(bytes, nBlock), expected)
                << "round " << round << ", block " << nBlock;
        }
    }
}

}  // namespace
