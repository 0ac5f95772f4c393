// The tokenizer through its public face: what a document is made of, and which are refused.

#include "xml/XmlTokenizer.h"

#include <gtest/gtest.h>

#include <cstddef>
#include <stdexcept>
#include <string>
#include <string_view>

#include "xml/MemorySource.h"

namespace Pegasus {
namespace {

using Token = XmlTokenizer::Token;
using Kind = XmlError::Kind;
using namespace std::string_literals;

// All tokens in one line: (name attribute=[value]) for a start, /name for an end, 'text', #cdata#.
std::string describe(XmlTokenizer& tokenizer) {
    std::string out;
    for (Token token = tokenizer.next(); token != Token::End; token = tokenizer.next()) {
        switch (token) {
            case Token::StartElement:
                out += "(" + std::string(tokenizer.name());
                for (const XmlTokenizer::Attribute& attribute : tokenizer.attributes()) {
                    out += " " + std::string(attribute.name) + "=[" + std::string(attribute.value) +
                           "]";
                }
                out += ")";
                break;
            case Token::EndElement:
                out += "/" + std::string(tokenizer.name());
                break;
            case Token::Text:
                out += "'" + std::string(tokenizer.text()) + "'";
                break;
            default:
                out += "#" + std::string(tokenizer.text()) + "#";
        }
    }
    return out;
}

std::string tokensOf(std::string_view document, std::size_t pieceSize) {
    MemorySource source(document, pieceSize);
    XmlTokenizer tokenizer(source);
    return describe(tokenizer);
}

struct Accepted {
    const char* why;
    std::string document;
    std::string tokens;
};

class AcceptedDocument : public testing::TestWithParam<Accepted> {};

TEST_P(AcceptedDocument, GivesItsTokensWhateverThePieces) {
    for (const std::size_t pieceSize : {~std::size_t{0}, std::size_t{1}, std::size_t{3}}) {
        EXPECT_EQ(tokensOf(GetParam().document, pieceSize), GetParam().tokens)
            << GetParam().why << ", pieces of " << pieceSize;
    }
}

const Accepted kAccepted[] = {
    {"one empty element", "<a/>", "(a)/a"},
    {"start and end", "<a></a>", "(a)/a"},
    {"white space in tags", "<a \t\r\n></a \n>", "(a)/a"},
    {"nested elements", "<a><b/><c>t</c></a>", "(a)(b)/b(c)'t'/c/a"},
    {"names of all kinds", "<VALUE.ARRAY x-1='' _y=\"\" n:z=''/>",
     "(VALUE.ARRAY x-1=[] _y=[] n:z=[])/VALUE.ARRAY"},
    {"names above ASCII", "<\xC3\xA9/>", "(\xC3\xA9)/\xC3\xA9"},
    {"both quotation marks", "<a b='\"' c=\"'\"/>", "(a b=[\"] c=['])/a"},
    {"blanks around =", "<a b = 'x'/>", "(a b=[x])/a"},
    {"> in a value", "<a b='>'/>", "(a b=[>])/a"},
    {"/ in a value", "<a b='/'></a>", "(a b=[/])/a"},
    {"white space in a value becomes blanks", "<a b='1\t2\n3\r4\r\n5'/>", "(a b=[1 2 3 4 5])/a"},
    {"references in a value are kept", "<a b='&#10;&#9;&quot;'/>", "(a b=[\n\t\"])/a"},
    {"the five entities", "<a>&lt;&gt;&amp;&quot;&apos;</a>", "(a)'<>&\"''/a"},
    {"decimal and hexadecimal references", "<a>&#65;&#x42;&#x6a;&#x6A;&#0067;</a>", "(a)'ABjjC'/a"},
    {"references of every length", "<a>&#127;&#128;&#x7FF;&#x800;&#xFFFD;&#x10000;&#x10FFFF;</a>",
     "(a)'\x7F\xC2\x80\xDF\xBF\xE0\xA0\x80\xEF\xBF\xBD\xF0\x90\x80\x80\xF4\x8F\xBF\xBF'/a"},
    {"references to control characters", "<a>&#1;&#x1F;&#31;</a>", "(a)'\x01\x1F\x1F'/a"},
    {"what a reference makes is not markup", "<a>&#60;b&#62;&#38;lt;</a>", "(a)'<b>&lt;'/a"},
    {"line ends become LF", "<a>1\r\n2\r3\n\r4</a>", "(a)'1\n2\n3\n\n4'/a"},
    {"a referred CR stays", "<a>&#13;\n</a>", "(a)'\r\n'/a"},
    {"CDATA is literal", "<a><![CDATA[<&amp;]] > ]]]]></a>", "(a)#<&amp;]] > ]]#/a"},
    {"empty CDATA", "<a><![CDATA[]]></a>", "(a)##/a"},
    {"line ends in CDATA", "<a><![CDATA[1\r\n2\r]]></a>", "(a)#1\n2\n#/a"},
    {"text around CDATA", "<a>x<![CDATA[y]]>z</a>", "(a)'x'#y#'z'/a"},
    {"comments", "<!-- - -><b> --><a>1<!---->2</a><!--x-->", "(a)'1''2'/a"},
    {"instructions", "<?p?><a><?q <b>?></a><?r s?>", "(a)/a"},
    {"white space around the root", " \r\n\t<a/> \r\n", "(a)/a"},
    {"declaration", "<?xml version=\"1.0\"?><a/>", "(a)/a"},
    {"encoding", "<?xml version='1.0' encoding='UTF-8' ?>\n<a/>", "(a)/a"},
    {"encoding in any case", "<?xml version='1.0' encoding='utf-8' standalone='yes'?><a/>",
     "(a)/a"},
    {"ASCII", "<?xml version='1.0' encoding='US-ASCII'?><a/>", "(a)/a"},
    {"XML 1.1", "<?xml version='1.1'?><a/>", "(a)/a"},
    {"byte-order mark", "\xEF\xBB\xBF<?xml version='1.0'?><a/>", "(a)/a"},
    {"UTF-8 of every length", "<a>\xC2\xA2\xE2\x82\xAC\xF0\x90\x8D\x88</a>",
     "(a)'\xC2\xA2\xE2\x82\xAC\xF0\x90\x8D\x88'/a"},
    {"the borders of UTF-8",
     "<a>\xDF\xBF\xE0\xA0\x80\xED\x9F\xBF\xEE\x80\x80\xF0\x90\x80\x80\xF4\x8F\xBF\xBF</a>",
     "(a)'\xDF\xBF\xE0\xA0\x80\xED\x9F\xBF\xEE\x80\x80\xF0\x90\x80\x80\xF4\x8F\xBF\xBF'/a"},
    {"DEL is a character", "<a>\x7F</a>", "(a)'\x7F'/a"},
    {"]] and ] in text", "<a>]]x]></a>", "(a)']]x]>'/a"},
};

INSTANTIATE_TEST_SUITE_P(XmlTokenizer, AcceptedDocument, testing::ValuesIn(kAccepted));

struct Refused {
    const char* why;
    std::string document;
    Kind kind;
    std::uint64_t offset;
    const char* part;  // of the message
};

class RefusedDocument : public testing::TestWithParam<Refused> {};

TEST_P(RefusedDocument, FailsAtItsPlaceWhateverThePieces) {
    for (const std::size_t pieceSize : {~std::size_t{0}, std::size_t{1}, std::size_t{3}}) {
        try {
            ADD_FAILURE() << GetParam().why << ": " << tokensOf(GetParam().document, pieceSize);
        } catch (const XmlError& error) {
            EXPECT_EQ(error.kind, GetParam().kind) << GetParam().why << ": " << error.message;
            EXPECT_EQ(error.offset, GetParam().offset) << GetParam().why << ": " << error.message;
            EXPECT_NE(error.message.find(GetParam().part), std::string::npos) << error.message;
            const std::string place = "; at byte " + std::to_string(GetParam().offset);
            EXPECT_TRUE(error.message.ends_with(place)) << error.message;
        }
    }
}

const Refused kRefused[] = {
    {"nothing", "", Kind::Truncated, 0, "root element"},
    {"blanks only", " \n", Kind::Truncated, 2, "root element"},
    {"a comment only", "<!---->", Kind::Truncated, 7, "root element"},
    {"text only", "x", Kind::Syntax, 0, "before the root"},
    {"text before the root", "x<a/>", Kind::Syntax, 0, "before the root"},
    {"text after the root", "<a/>x", Kind::Syntax, 4, "after the root"},
    {"two roots", "<a/><b/>", Kind::Syntax, 4, "second root"},
    {"CDATA outside", "<![CDATA[]]><a/>", Kind::Syntax, 0, "outside"},
    {"open root", "<a>", Kind::Truncated, 3, "\"a\""},
    {"open element", "<a><b></b>", Kind::Truncated, 10, "\"a\""},
    {"tag without end", "<a b='c'", Kind::Truncated, 8, "ends too early"},
    {"value without end", "<a b='c>", Kind::Truncated, 8, "ends too early"},
    {"text without end", "<a>text", Kind::Truncated, 7, "\"a\""},
    {"comment without end", "<a><!-- -->-</a><!-- -", Kind::Truncated, 22, "comment"},
    {"CDATA without end", "<a><![CDATA[ ]]", Kind::Truncated, 15, "\"a\""},
    {"instruction without end", "<?p ?", Kind::Truncated, 5, "root element"},
    {"end tag without end", "<a></a", Kind::Truncated, 6, "\"a\""},
    {"wrong end tag", "<a><b></a></b>", Kind::Syntax, 6, "that of \"b\""},
    {"end tag of other case", "<a></A>", Kind::Syntax, 3, "that of \"a\""},
    {"end tag too many", "<a/></a>", Kind::Syntax, 4, "closes nothing"},
    {"end tag first", "</a>", Kind::Syntax, 0, "closes nothing"},
    {"end tag with attribute", "<a></a b=''>", Kind::Syntax, 7, "goes on"},
    {"blank before name", "< a/>", Kind::Syntax, 1, "element's name"},
    {"no name", "<>", Kind::Syntax, 1, "element's name"},
    {"digit as name", "<1/>", Kind::Syntax, 1, "element's name"},
    {"attribute twice", "<a b='' c='' b=''/>", Kind::Syntax, 13, "given twice"},
    {"attribute without value", "<a b/>", Kind::Syntax, 4, "expected \"=\""},
    {"attribute without quotes", "<a b=c/>", Kind::Syntax, 5, "quotation mark"},
    {"attributes without a blank", "<a b=''c=''/>", Kind::Syntax, 7, "white space"},
    {"name that goes on", "<a!/>", Kind::Syntax, 2, "white space"},
    {"< in a value", "<a b='<'/>", Kind::Syntax, 6, "inside a tag"},
    {"< in a tag", "<a <b/>", Kind::Syntax, 3, "inside a tag"},
    {"]]> in text", "<a>]]></a>", Kind::Syntax, 5, "]]&gt;"},
    {"document type", "<!DOCTYPE a><a/>", Kind::Syntax, 0, "document type"},
    {"entity definitions", "<!DOCTYPE a [<!ENTITY x \"y\"><!ENTITY z \"&x;&x;\">]><a>&z;</a>",
     Kind::Syntax, 0, "document type"},
    {"other declaration", "<a><!ELEMENT a></a>", Kind::Syntax, 3, "neither"},
    {"-- in a comment", "<!-- -- --><a/>", Kind::Syntax, 7, "-->"},
    {"comment of three dashes", "<!--->", Kind::Truncated, 6, "ends too early"},
    {"late declaration", " <?xml version='1.0'?><a/>", Kind::Syntax, 3, "beginning"},
    {"XML in capitals", "<?XML version='1.0'?><a/>", Kind::Syntax, 2, "beginning"},
    {"no version", "<?xml encoding='UTF-8'?><a/>", Kind::Syntax, 5, "version"},
    {"version 2", "<?xml version='2.0'?><a/>", Kind::Syntax, 5, "version"},
    {"other encoding", "<?xml version='1.0' encoding='ISO-8859-1'?><a/>", Kind::Syntax, 5,
     "expected UTF-8"},
    {"order in a declaration", "<?xml version='1.0' standalone='no' encoding='UTF-8'?><a/>",
     Kind::Syntax, 5, "malformed"},
    {"standalone", "<?xml version='1.0' standalone='maybe'?><a/>", Kind::Syntax, 5, "malformed"},
    {"instruction without name", "<? ?><a/>", Kind::Syntax, 2, "name"},
    {"undefined entity", "<a>12&nbsp;</a>", Kind::Syntax, 5, "\"nbsp\" is not defined"},
    {"undefined entity in a value", "<a b='&x;'/>", Kind::Syntax, 6, "\"x\" is not defined"},
    {"bare &", "<a>1 & 2</a>", Kind::Syntax, 5, "&amp;"},
    {"empty reference", "<a>&;</a>", Kind::Syntax, 3, "not defined"},
    {"reference without digits", "<a>&#;</a>", Kind::Syntax, 3, "names no character"},
    {"hexadecimal without digits", "<a>&#x;</a>", Kind::Syntax, 3, "names no character"},
    {"hexadecimal with X", "<a>&#X41;</a>", Kind::Syntax, 3, "names no character"},
    {"letters in decimal", "<a>&#4A;</a>", Kind::Syntax, 3, "names no character"},
    {"signed reference", "<a>&#-1;</a>", Kind::Syntax, 3, "names no character"},
    {"character 0", "<a>&#0;</a>", Kind::Syntax, 3, "names no character"},
    {"first surrogate", "<a>&#xD800;</a>", Kind::Syntax, 3, "names no character"},
    {"last surrogate", "<a>&#57343;</a>", Kind::Syntax, 3, "names no character"},
    {"U+FFFF", "<a>&#xFFFF;</a>", Kind::Syntax, 3, "names no character"},
    {"above Unicode", "<a>&#x110000;</a>", Kind::Syntax, 3, "names no character"},
    {"number beyond all types", "<a>&#99999999999999999999999;</a>", Kind::Syntax, 3,
     "names no character"},
    {"NUL", "<a>\0</a>"s, Kind::Syntax, 3, "octet 00"},
    {"NUL at the beginning", "\0<a/>"s, Kind::Syntax, 0, "octet 00"},
    {"control character", "<a>x\x01</a>", Kind::Syntax, 4, "octet 01"},
    {"control in a value", "<a b='\x1F'/>", Kind::Syntax, 6, "octet 1F"},
    {"control in CDATA", "<a><![CDATA[\x0B]]></a>", Kind::Syntax, 12, "octet 0B"},
    {"control in a comment", "<!--\x08--><a/>", Kind::Syntax, 4, "octet 08"},
    {"raw U+FFFE", "<a>\xEF\xBF\xBE</a>", Kind::Syntax, 3, "octet EF"},
    {"UTF-16, big end first", "\xFE\xFF\0<\0a"s, Kind::Syntax, 0, "UTF-16"},
    {"UTF-16, little end first", "\xFF\xFE<\0a\0"s, Kind::Syntax, 0, "UTF-16"},
    {"UTF-16 without a mark", "<\0a\0/\0>\0"s, Kind::Syntax, 1, "octet 00"},
    {"octet FF", "<a>\xFF</a>", Kind::InvalidUtf8, 3, "octet FF"},
    {"lone continuation", "<a>\x80</a>", Kind::InvalidUtf8, 3, "octet 80"},
    {"continuation missing", "<a>\xC3</a>", Kind::InvalidUtf8, 3, "octet C3"},
    {"second continuation missing", "<a>\xE2\x82</a>", Kind::InvalidUtf8, 3, "octet E2"},
    {"overlong /", "<a>\xC0\xAF</a>", Kind::InvalidUtf8, 3, "octet C0"},
    {"overlong in three", "<a>\xE0\x9F\xBF</a>", Kind::InvalidUtf8, 3, "octet E0"},
    {"overlong in four", "<a>\xF0\x8F\xBF\xBF</a>", Kind::InvalidUtf8, 3, "octet F0"},
    {"surrogate", "<a>\xED\xA0\x80</a>", Kind::InvalidUtf8, 3, "octet ED"},
    {"last surrogate in UTF-8", "<a>\xED\xBF\xBF</a>", Kind::InvalidUtf8, 3, "octet ED"},
    {"above U+10FFFF", "<a>\xF4\x90\x80\x80</a>", Kind::InvalidUtf8, 3, "octet F4"},
    {"in a name", "<a\xFF/>", Kind::InvalidUtf8, 2, "octet FF"},
    {"in a value", "<a b='\xFF'/>", Kind::InvalidUtf8, 6, "octet FF"},
    {"in a comment", "<a/><!--\xFF-->", Kind::InvalidUtf8, 8, "octet FF"},
    {"cut in a character", "<a/>\xE2\x82", Kind::InvalidUtf8, 4, "octet E2"},
    // The earlier of two faults counts, also when both arrive in one piece.
    {"syntax before UTF-8", "<a></b>\xFF", Kind::Syntax, 3, "that of \"a\""},
};

INSTANTIATE_TEST_SUITE_P(XmlTokenizer, RefusedDocument, testing::ValuesIn(kRefused));

std::string repeated(std::string_view text, std::size_t count) {
    std::string out;
    out.reserve(text.size() * count);
    for (std::size_t i = 0; i < count; ++i) {
        out += text;
    }
    return out;
}

XmlError errorOf(std::string_view document, XmlTokenizer::Limits limits = {}) {
    MemorySource source(document);
    XmlTokenizer tokenizer(source, limits);
    try {
        describe(tokenizer);
    } catch (const XmlError& error) {
        return error;
    }
    ADD_FAILURE() << "accepted";
    return {};
}

TEST(XmlTokenizerLimits, NestingUpToTheLimitIsAccepted) {
    const std::string document = repeated("<a>", 64) + repeated("</a>", 64);
    EXPECT_EQ(tokensOf(document, document.size()), repeated("(a)", 64) + repeated("/a", 64));
}

TEST(XmlTokenizerLimits, AMillionLevelsEndAtTheLimit) {
    const XmlError error = errorOf(repeated("<a>", 1000000));
    EXPECT_EQ(error.kind, Kind::Limit);
    EXPECT_EQ(error.offset, 64U * 3);
}

TEST(XmlTokenizerLimits, AttributesUpToTheLimitAreAccepted) {
    std::string document = "<a";
    std::string tokens = "(a";
    for (int i = 0; i < 64; ++i) {
        document += " n" + std::to_string(i) + "=''";
        tokens += " n" + std::to_string(i) + "=[]";
    }
    EXPECT_EQ(tokensOf(document + "/>", document.size()), tokens + ")/a");
    EXPECT_EQ(errorOf(document + " n64=''/>").kind, Kind::Limit);
}

TEST(XmlTokenizerLimits, AMillionAttributesEndAtTheLimit) {
    std::string document = "<a";
    for (int i = 0; i < 1000000; ++i) {
        document += " n" + std::to_string(i) + "=''";
    }
    EXPECT_EQ(errorOf(document + "/>").kind, Kind::Limit);
}

TEST(XmlTokenizerLimits, TokensAreBounded) {
    XmlTokenizer::Limits limits;
    limits.tokenSize = 100000;
    const std::string fits(100000, 'x');
    const std::string document = "<a>" + fits + "</a>";
    MemorySource source(document);
    XmlTokenizer tokenizer(source, limits);
    EXPECT_EQ(describe(tokenizer), "(a)'" + fits + "'/a");

    const std::string tooLong = fits + "x";
    for (const std::string& longer :
         {"<a>" + tooLong + "</a>", "<a>" + tooLong, "<a b='" + tooLong + "'/>", "<" + tooLong,
          "<!--" + tooLong + "--><a/>", "<?p " + tooLong + "?><a/>",
          "<a><![CDATA[" + tooLong + "]]></a>", "</" + tooLong + ">"}) {
        EXPECT_EQ(errorOf(longer, limits).kind, Kind::Limit) << longer.substr(0, 20);
    }
}

// A fuzzer found a tag that was refused for its length when it arrived octet by octet, and for a
// "<" behind the limit when it arrived at once.
TEST(XmlTokenizerLimits, AFaultBehindTheLimitDoesNotCount) {
    XmlTokenizer::Limits limits;
    limits.tokenSize = 20;
    const std::string filler(30, 'x');
    for (const std::string& document :
         {"<a " + filler + "<", "<a b='" + filler + "<", "<a>" + filler + "]]>", "<a " + filler,
          "<!--" + filler + "-- -->", "<a>" + filler + "\xFF"}) {
        for (const std::size_t pieceSize : {std::size_t{1}, std::size_t{7}, document.size()}) {
            MemorySource source(document, pieceSize);
            XmlTokenizer tokenizer(source, limits);
            try {
                describe(tokenizer);
                ADD_FAILURE() << document;
            } catch (const XmlError& error) {
                EXPECT_EQ(error.kind, Kind::Limit) << document << ": " << error.message;
            }
        }
    }
}

TEST(XmlTokenizerLimits, ShortTokensPassWhateverTheirSum) {
    XmlTokenizer::Limits limits;
    limits.tokenSize = 1000;
    const std::string document = "<a>" + repeated("<b c='d'>text</b>\n", 100000) + "</a>";
    MemorySource source(document, 4000);
    XmlTokenizer tokenizer(source, limits);
    std::size_t starts = 0;
    for (Token token = tokenizer.next(); token != Token::End; token = tokenizer.next()) {
        starts += token == Token::StartElement ? 1 : 0;
    }
    EXPECT_EQ(starts, 100001U);
}

TEST(XmlTokenizer, AHeldTextSurvivesTheNextToken) {
    // Longer than any window, so that the text must move when its end tag is read.
    const std::string text(300000, 'x');
    const std::string document = "<a>" + text + "</a>";
    for (const std::size_t pieceSize : {std::size_t{1000}, std::size_t{65536}}) {
        MemorySource source(document, pieceSize);
        XmlTokenizer tokenizer(source);
        EXPECT_EQ(tokenizer.next(), Token::StartElement);
        EXPECT_EQ(tokenizer.next(), Token::Text);
        EXPECT_EQ(tokenizer.nextHoldingText(), Token::EndElement);
        EXPECT_TRUE(tokenizer.heldText() == text);
        EXPECT_EQ(tokenizer.next(), Token::End);
        EXPECT_EQ(tokenizer.next(), Token::End);
    }
}

TEST(XmlTokenizer, OffsetsCountOctetsOfTheDocument) {
    const std::string document = "<a>" + std::string(200000, ' ') + "&amp;<b/></a>";
    MemorySource source(document, 5000);
    XmlTokenizer tokenizer(source);
    tokenizer.next();
    EXPECT_EQ(tokenizer.offset(), 0U);
    tokenizer.next();
    EXPECT_EQ(tokenizer.offset(), 3U);
    tokenizer.next();
    EXPECT_EQ(tokenizer.name(), "b");
    EXPECT_EQ(tokenizer.offset(), 200008U);
}

TEST(XmlTokenizer, DepthCountsOpenElements) {
    MemorySource source("<a><b/></a>");
    XmlTokenizer tokenizer(source);
    EXPECT_EQ(tokenizer.depth(), 0U);
    tokenizer.next();
    EXPECT_EQ(tokenizer.depth(), 1U);
    tokenizer.next();
    EXPECT_EQ(tokenizer.depth(), 2U);
    tokenizer.next();
    EXPECT_EQ(tokenizer.depth(), 1U);
    tokenizer.next();
    EXPECT_EQ(tokenizer.depth(), 0U);
}

class FailingSource : public ByteSource {
  public:
    std::size_t read(char* buffer, std::size_t capacity) override {
        static_cast<void>(capacity);
        if (hasGiven) {
            throw std::runtime_error("the line is cut");
        }
        hasGiven = true;
        std::string_view("<a>").copy(buffer, 3);
        return 3;
    }

  private:
    bool hasGiven = false;
};

TEST(XmlTokenizer, ExceptionsOfTheSourcePass) {
    FailingSource source;
    XmlTokenizer tokenizer(source);
    EXPECT_EQ(tokenizer.next(), Token::StartElement);
    EXPECT_THROW(tokenizer.next(), std::runtime_error);
}

constexpr const char* kOneValue = "<P><VALUE>1</VALUE></P>";

TEST(XmlTokenizer, ReadsWhatIsLikeAnEarlierElement) {
    const MarkupRun run = MarkupRun::of(kOneValue, true).value();
    MemorySource source("<r><P><VALUE>a</VALUE></P><P><VALUE>&lt;b&#62;</VALUE></P><P/></r>");
    XmlTokenizer tokenizer(source);
    tokenizer.next();
    ASSERT_TRUE(tokenizer.readLike(run));
    ASSERT_EQ(tokenizer.textCount(), 1U);
    const std::string_view first = tokenizer.takeText();
    EXPECT_EQ(first, "a");
    EXPECT_EQ(tokenizer.offsetOf(first), 13U);
    EXPECT_EQ(tokenizer.position(), 26U);
    ASSERT_TRUE(tokenizer.readLike(run));
    EXPECT_EQ(tokenizer.takeText(), "<b>");
    EXPECT_FALSE(tokenizer.readLike(run));
    EXPECT_EQ(describe(tokenizer), "(P)/P/r");
}

TEST(XmlTokenizer, ReadsAnyNumberOfTextsInTurn) {
    const MarkupRun run = MarkupRun::of("<P><VALUE>1</VALUE> <VALUE>2</VALUE></P>", true).value();
    MemorySource source(
        "<r><P><VALUE>a</VALUE> <VALUE>&amp;lt;</VALUE> <VALUE>&none;</VALUE></P></r>");
    XmlTokenizer tokenizer(source);
    tokenizer.next();
    ASSERT_TRUE(tokenizer.readLike(run));
    ASSERT_EQ(tokenizer.textCount(), 3U);
    EXPECT_EQ(tokenizer.takeText(), "a");
    EXPECT_EQ(tokenizer.takeText(), "&lt;");
    try {
        tokenizer.takeText();
        ADD_FAILURE() << "no error";
    } catch (const XmlError& error) {
        EXPECT_EQ(error.message, "entity \"none\" is not defined; at byte 54");
    }
}

TEST(XmlTokenizer, LeavesWhatDiffersToBeRead) {
    const MarkupRun run = MarkupRun::of(kOneValue, true).value();
    for (const char* element :
         {"<P><VALUE>a>b</VALUE></P>", "<P><VALUE>a\rb</VALUE></P>", "<P><VALUE>1</VALUE ></P>",
          "<P><VALUE><b/></VALUE></P>", "<P><VALUE>1</VALUE><VALUE>2</VALUE></P>",
          " <P><VALUE>1</VALUE></P>", "<P><VALUE>1"}) {
        const std::string document = "<r>" + std::string(element);
        MemorySource source(document);
        XmlTokenizer tokenizer(source);
        tokenizer.next();
        EXPECT_FALSE(tokenizer.readLike(run)) << element;
        EXPECT_EQ(tokenizer.position(), 3U) << element;
    }
}

TEST(XmlTokenizer, FindsNothingLikeItInAnElementThatIsEmpty) {
    const MarkupRun run = MarkupRun::of("<P/>", false).value();
    MemorySource source("<r><e/><P/></r>");
    XmlTokenizer tokenizer(source);
    tokenizer.next();
    tokenizer.next();
    EXPECT_EQ(tokenizer.name(), "e");
    EXPECT_FALSE(tokenizer.readLike(run));
    EXPECT_EQ(tokenizer.next(), Token::EndElement);
    EXPECT_TRUE(tokenizer.readLike(run));
    EXPECT_EQ(tokenizer.textCount(), 0U);
    EXPECT_EQ(describe(tokenizer), "/r");
}

// Elements that are recognised are as deep as others, and their texts as long.
TEST(XmlTokenizer, KeepsItsLimitsForWhatIsLikeAnEarlierElement) {
    const MarkupRun run = MarkupRun::of(kOneValue, true).value();
    const auto isRead = [&](XmlTokenizer::Limits limits) {
        MemorySource source("<r><P><VALUE>123456789</VALUE></P></r>");
        XmlTokenizer tokenizer(source, limits);
        tokenizer.next();
        return tokenizer.readLike(run);
    };
    XmlTokenizer::Limits limits;
    limits.depth = 4;
    limits.tokenSize = 9;
    EXPECT_TRUE(isRead(limits));
    limits.depth = 3;
    EXPECT_FALSE(isRead(limits));
    limits.depth = 4;
    limits.tokenSize = 8;
    EXPECT_FALSE(isRead(limits));
}

TEST(XmlTokenizer, TellsTheOctetsReadAsLongAsTheyAreAtHand) {
    MemorySource source("<r><P N=\"1\"/><Q>&lt;</Q></r>");
    XmlTokenizer tokenizer(source);
    tokenizer.next();
    const std::uint64_t begin = tokenizer.position();
    tokenizer.next();
    tokenizer.next();
    EXPECT_EQ(tokenizer.readSince(begin), "<P N=\"1\"/>");
    const std::uint64_t second = tokenizer.position();
    tokenizer.next();
    EXPECT_EQ(tokenizer.readSince(second), "<Q>");
    tokenizer.next();
    // The reference was replaced in place.
    EXPECT_EQ(tokenizer.readSince(second), "");
    EXPECT_EQ(tokenizer.readSince(tokenizer.position()), "");
}

}  // namespace
}  // namespace Pegasus
