#include "platform/access/ExpressionNode.h"
#include "platform/access/SqlTokens.h"
#include "platform/text/Text.h"

#include <array>
#include <charconv>

namespace tovimar::platform::access {

namespace {

using Node = ExpressionNode;
using NodePtr = std::unique_ptr<Node>;

constexpr std::size_t kLongestExpression = 1500; ///< tokens
constexpr int kDeepest = 60;

/// Levels from the loosest to the tightest; each holds the operators of one precedence.
constexpr std::array<std::array<std::string_view, 6>, 8> kLevels{{{"or", "xor"},
                                                                  {"and"},
                                                                  {"=", "<>", "<", ">", "<=", ">="},
                                                                  {"&"},
                                                                  {"+", "-"},
                                                                  {"mod"},
                                                                  {"*", "/", "\\"},
                                                                  {"^"}}};
constexpr std::size_t kAnd = 1, kComparison = 2;

/// A recursive descent over the tokens; null stands for a text that is no expression.
class Parser {
public:
    explicit Parser(std::string_view text) : text_(text), tokens_(TokenizeSql(text)) {}

    NodePtr Run() {
        if (tokens_.empty() || tokens_.size() > kLongestExpression)
            return nullptr;
        auto root = Level(0);
        return next_ == tokens_.size() ? std::move(root) : nullptr;
    }

private:
    bool AtEnd() const { return next_ >= tokens_.size(); }
    bool AtSymbol(char symbol) const { return !AtEnd() && tokens_[next_].IsSymbol(symbol); }
    bool AtWord(std::string_view word) const { return !AtEnd() && tokens_[next_].IsWord(word); }
    bool Adjacent(std::size_t at) const {
        return at + 1 < tokens_.size() && tokens_[at].end == tokens_[at + 1].begin;
    }

    static NodePtr Operator(std::string word, NodePtr left, NodePtr right) {
        if (!left || !right)
            return nullptr;
        auto node = std::make_unique<Node>();
        node->kind = Node::Kind::Operator;
        node->word = std::move(word);
        node->parts.push_back(std::move(left));
        node->parts.push_back(std::move(right));
        return node;
    }

    static NodePtr Not(NodePtr part) { return Wrapped("not", std::move(part)); }
    static NodePtr Wrapped(std::string word, NodePtr part) {
        if (!part)
            return nullptr;
        auto node = std::make_unique<Node>();
        node->kind = Node::Kind::Operator;
        node->word = std::move(word);
        node->parts.push_back(std::move(part));
        return node;
    }

    static NodePtr Literal(Datum value) {
        auto node = std::make_unique<Node>();
        node->literal = std::move(value);
        return node;
    }

    /// The operator of a level at this place; empty when there is none.
    std::string TakeOperator(std::size_t level) {
        if (AtEnd())
            return {};
        const auto& token = tokens_[next_];
        auto word = text::FoldCase(token.text);
        if (token.kind == SqlToken::Kind::Bracketed || token.kind == SqlToken::Kind::Text)
            return {};
        std::size_t taken = 1;
        if ((word == "<" || word == ">") && Adjacent(next_)) {
            const auto both = word + tokens_[next_ + 1].text;
            if (both == "<>" || both == "<=" || both == ">=") {
                word = both;
                taken = 2;
            }
        }
        for (const auto candidate : kLevels[level])
            if (!candidate.empty() && candidate == word) {
                next_ += taken;
                return word;
            }
        return {};
    }

    NodePtr Level(std::size_t level) {
        if (level == kLevels.size())
            return Signed();
        if (level == kComparison && AtWord("Not")) {
            ++next_;
            return Nested([&] { return Not(Level(kComparison)); });
        }
        auto left = Level(level + 1);
        while (left) {
            if (level == kComparison &&
                (AtWord("Is") || AtWord("Like") || AtWord("In") || AtWord("Between") || AtWord("Not"))) {
                left = Predicate(std::move(left));
                continue;
            }
            auto word = TakeOperator(level);
            if (word.empty())
                break;
            left = Operator(std::move(word), std::move(left), Level(level + 1));
        }
        return left;
    }

    template <typename Parse> NodePtr Nested(const Parse& parse) {
        if (depth_ >= kDeepest)
            return nullptr;
        ++depth_;
        auto node = parse();
        --depth_;
        return node;
    }

    /// "Is [Not] Null", "[Not] Like ...", "[Not] In (...)", "[Not] Between ... And ...".
    NodePtr Predicate(NodePtr left) {
        bool negated = AtWord("Not");
        next_ += negated ? 1 : 0;
        const auto word = AtEnd() ? std::string() : text::FoldCase(tokens_[next_].text);
        ++next_;
        NodePtr node;
        if (word == "is") {
            negated = AtWord("Not");
            next_ += negated ? 1 : 0;
            if (!AtWord("Null"))
                return nullptr;
            ++next_;
            node = Wrapped("is null", std::move(left));
        } else if (word == "like") {
            node = Operator("like", std::move(left), Level(kComparison + 1));
        } else if (word == "between") {
            node = Operator("between", std::move(left), Level(kComparison + 1));
            if (!node || !AtWord("And"))
                return nullptr;
            ++next_;
            auto upper = Level(kComparison + 1);
            if (!upper)
                return nullptr;
            node->parts.push_back(std::move(upper));
        } else if (word == "in" && AtSymbol('(')) {
            ++next_;
            node = Wrapped("in", std::move(left));
            if (!node || !TakeArguments(*node))
                return nullptr;
        }
        return negated ? Not(std::move(node)) : std::move(node);
    }

    NodePtr Signed() {
        if (AtSymbol('-') || AtSymbol('+')) {
            const bool minus = AtSymbol('-');
            ++next_;
            return Nested([&] { return minus ? Wrapped("negative", Signed()) : Signed(); });
        }
        return Primary();
    }

    NodePtr Primary() {
        if (AtEnd())
            return nullptr;
        const auto& token = tokens_[next_];
        if (token.IsSymbol('(')) {
            ++next_;
            auto inner = Nested([&] { return Level(0); });
            if (!AtSymbol(')'))
                return nullptr;
            ++next_;
            return inner;
        }
        if (token.kind == SqlToken::Kind::Text)
            return Quoted();
        if (token.IsSymbol('.') ||
            (token.kind == SqlToken::Kind::Word && token.text[0] >= '0' && token.text[0] <= '9'))
            return Number();
        // "*" is the argument of Count alone.
        if (token.IsSymbol('*')) {
            ++next_;
            return Literal(Datum::Number(1));
        }
        return token.IsName() ? NameOrCall() : nullptr;
    }

    NodePtr Quoted() {
        const auto& token = tokens_[next_++];
        if (text_[token.begin] != '#')
            return Literal(Datum::Text(token.text));
        const auto days = ParseDate(token.text);
        return days ? Literal(Datum::Date(*days)) : nullptr;
    }

    NodePtr Number() {
        const auto begin = tokens_[next_].begin;
        auto last = next_;
        while (Adjacent(last) && (tokens_[last + 1].IsSymbol('.') || tokens_[last].IsSymbol('.')))
            ++last;
        const auto digits = text_.substr(begin, tokens_[last].end - begin);
        next_ = last + 1;
        double value = 0;
        const auto result = std::from_chars(digits.data(), digits.data() + digits.size(), value);
        return result.ptr == digits.data() + digits.size() ? Literal(Datum::Number(value)) : nullptr;
    }

    NodePtr NameOrCall() {
        const bool bare = tokens_[next_].kind == SqlToken::Kind::Word;
        NamePath name{tokens_[next_++].text};
        while ((AtSymbol('.') || AtSymbol('!')) && next_ + 1 < tokens_.size() &&
               tokens_[next_ + 1].IsName()) {
            name.push_back(tokens_[next_ + 1].text);
            next_ += 2;
        }
        auto node = std::make_unique<Node>();
        if (bare && name.size() == 1 && AtSymbol('(')) {
            ++next_;
            node->kind = Node::Kind::Call;
            node->word = text::FoldCase(name[0]);
            if (node->word.ends_with('$'))
                node->word.pop_back();
            return TakeArguments(*node) ? std::move(node) : nullptr;
        }
        // "[Customer].[Column](2)" is a name with the number as its last part.
        if (name.size() > 1 && text::EqualsIgnoringCase(name.back(), "Column") &&
            next_ + 2 < tokens_.size() && AtSymbol('(') && tokens_[next_ + 2].IsSymbol(')')) {
            name.push_back(tokens_[next_ + 1].text);
            next_ += 3;
        }
        if (bare && name.size() == 1)
            if (auto constant = ConstantNamed(text::FoldCase(name[0])))
                return Literal(std::move(*constant));
        node->kind = Node::Kind::Name;
        node->name = std::move(name);
        return node;
    }

    /// Up to the closing parenthesis, which is taken as well.
    bool TakeArguments(Node& node) {
        if (AtSymbol(')')) {
            ++next_;
            return true;
        }
        while (true) {
            auto part = Nested([&] { return Level(0); });
            if (!part)
                return false;
            node.parts.push_back(std::move(part));
            if (AtEnd() || !(AtSymbol(',') || AtSymbol(';') || AtSymbol(')')))
                return false;
            if (tokens_[next_++].IsSymbol(')'))
                return true;
        }
    }

    std::string_view text_;
    std::vector<SqlToken> tokens_;
    std::size_t next_ = 0;
    int depth_ = 0;
};

void CollectEqualities(const Node& node, std::vector<std::pair<NamePath, NamePath>>& equalities) {
    if (node.kind != Node::Kind::Operator)
        return;
    if (node.word == kLevels[kAnd][0])
        for (const auto& part : node.parts)
            CollectEqualities(*part, equalities);
    if (node.word == "=" && node.parts[0]->kind == Node::Kind::Name &&
        node.parts[1]->kind == Node::Kind::Name)
        equalities.emplace_back(node.parts[0]->name, node.parts[1]->name);
}

bool HoldsAggregate(const Node& node) {
    if (node.kind == Node::Kind::Call && IsAggregateFunction(node.word))
        return true;
    for (const auto& part : node.parts)
        if (HoldsAggregate(*part))
            return true;
    return false;
}

} // namespace

std::optional<Expression> Expression::Parse(std::string_view text) {
    std::shared_ptr<const Node> root = Parser(text).Run();
    return root ? std::optional<Expression>(Expression(std::move(root))) : std::nullopt;
}

bool Expression::HasAggregate() const {
    return HoldsAggregate(*root_);
}

const NamePath* Expression::AsName() const {
    return root_->kind == Node::Kind::Name ? &root_->name : nullptr;
}

std::vector<std::pair<NamePath, NamePath>> Expression::Equalities() const {
    std::vector<std::pair<NamePath, NamePath>> equalities;
    CollectEqualities(*root_, equalities);
    return equalities;
}

} // namespace tovimar::platform::access
