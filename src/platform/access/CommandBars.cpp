#include "platform/access/CommandBars.h"

#include "platform/access/LateBound.h"

#include <algorithm>
#include <vector>

namespace tovimar::platform::access {

namespace {

[[noreturn]] void RaiseInvalidCall(const std::string& source) {
    throw RaisedError(5, "Invalid procedure call or argument", source);
}

/// A list of named objects from position 1, which grows and shrinks.
template <class T>
std::shared_ptr<T> Entry(const std::vector<std::shared_ptr<T>>& entries, const Value& key) {
    if (key.IsInteger()) {
        const auto position = static_cast<std::int64_t>(key.AsInteger());
        if (position >= 1 && position <= static_cast<std::int64_t>(entries.size()))
            return entries[static_cast<std::size_t>(position - 1)];
        return nullptr;
    }
    const auto found = std::find_if(entries.begin(), entries.end(), [&](const auto& entry) {
        return text::EqualsIgnoringCase(entry->Label(), key.AsString());
    });
    return found == entries.end() ? nullptr : *found;
}

/// A button; what it looks like is the business of whoever shows it.
class BarControl : public LateBound<BarControl> {
public:
    std::string ClassName() const override { return "CommandBarButton"; }
    static const MemberTable<BarControl>& Members() {
        static const MemberTable<BarControl> kMembers{
            {"Caption", &BarControl::ReadCaption, &BarControl::WriteCaption},
            {"Style", &BarControl::ReadStyle, &BarControl::WriteStyle},
        };
        return kMembers;
    }
    const std::string& Label() const { return caption_; }

private:
    Value ReadCaption(const Arguments&) { return caption_; }
    void WriteCaption(const Value& value) { caption_ = value.AsString(); }
    Value ReadStyle(const Arguments&) { return style_; }
    void WriteStyle(const Value& value) { style_ = value.AsInteger(); }

    std::string caption_;
    std::int32_t style_ = 0;
};

class BarControls : public LateBound<BarControls> {
public:
    std::string ClassName() const override { return "CommandBarControls"; }
    static const MemberTable<BarControls>& Members() {
        static const MemberTable<BarControls> kMembers{
            {"Count", &BarControls::ReadCount}, {"Item", &BarControls::ReadItem}, {"Add", &BarControls::Add}};
        return kMembers;
    }

private:
    Value ReadCount(const Arguments&) { return static_cast<std::int32_t>(controls_.size()); }
    Value ReadItem(const Arguments& arguments) {
        const auto control = Entry(controls_, ArgumentAt(arguments, 0));
        if (control == nullptr)
            RaiseInvalidCall(ClassName());
        return ObjectValue(control);
    }
    Value Add(const Arguments&) {
        controls_.push_back(std::make_shared<BarControl>());
        return ObjectValue(controls_.back());
    }

    std::vector<std::shared_ptr<BarControl>> controls_;
};

class CommandBar : public LateBound<CommandBar> {
public:
    CommandBar(std::string name, std::weak_ptr<AutomationObject> bars)
        : name_(std::move(name)), bars_(std::move(bars)) {}
    std::string ClassName() const override { return "CommandBar"; }
    static const MemberTable<CommandBar>& Members() {
        static const MemberTable<CommandBar> kMembers{
            {"Name", &CommandBar::ReadName},
            {"Visible", &CommandBar::ReadVisible, &CommandBar::WriteVisible},
            {"Left", &CommandBar::ReadLeft, &CommandBar::WriteLeft},
            {"Top", &CommandBar::ReadTop, &CommandBar::WriteTop},
            {"RowIndex", &CommandBar::ReadRow, &CommandBar::WriteRow},
            {"Controls", &CommandBar::ReadControls},
            {"Delete", &CommandBar::Delete},
        };
        return kMembers;
    }
    const std::string& Label() const { return name_; }

private:
    Value ReadName(const Arguments&) { return name_; }
    Value ReadVisible(const Arguments&) { return visible_; }
    void WriteVisible(const Value& value) { visible_ = value.AsBoolean(); }
    Value ReadLeft(const Arguments&) { return left_; }
    void WriteLeft(const Value& value) { left_ = value.AsInteger(); }
    Value ReadTop(const Arguments&) { return top_; }
    void WriteTop(const Value& value) { top_ = value.AsInteger(); }
    Value ReadRow(const Arguments&) { return row_; }
    void WriteRow(const Value& value) { row_ = value.AsInteger(); }
    Value ReadControls(const Arguments& arguments) {
        return arguments.empty() ? ObjectValue(controls_) : controls_->Get("Item", arguments);
    }
    Value Delete(const Arguments& arguments);

    std::string name_;
    std::weak_ptr<AutomationObject> bars_;
    std::shared_ptr<BarControls> controls_ = std::make_shared<BarControls>();
    bool visible_ = false;
    std::int32_t left_ = 0;
    std::int32_t top_ = 0;
    std::int32_t row_ = 0;
};

class CommandBars : public LateBound<CommandBars> {
public:
    std::string ClassName() const override { return "CommandBars"; }
    static const MemberTable<CommandBars>& Members() {
        static const MemberTable<CommandBars> kMembers{
            {"Count", &CommandBars::ReadCount}, {"Item", &CommandBars::ReadItem}, {"Add", &CommandBars::Add}};
        return kMembers;
    }
    Value Add(const Arguments& arguments) {
        const std::string name = TextAt(arguments, 0);
        if (name.empty() || Entry(bars_, Value(name)) != nullptr)
            RaiseInvalidCall(ClassName());
        bars_.push_back(std::make_shared<CommandBar>(name, weak_from_this()));
        return ObjectValue(bars_.back());
    }
    void Remove(const CommandBar* bar) {
        std::erase_if(bars_, [&](const auto& one) { return one.get() == bar; });
    }

private:
    Value ReadCount(const Arguments&) { return static_cast<std::int32_t>(bars_.size()); }
    Value ReadItem(const Arguments& arguments) {
        const auto bar = Entry(bars_, ArgumentAt(arguments, 0));
        if (bar == nullptr)
            RaiseInvalidCall(ClassName());
        return ObjectValue(bar);
    }

    std::vector<std::shared_ptr<CommandBar>> bars_;
};

Value CommandBar::Delete(const Arguments&) {
    if (const auto bars = bars_.lock())
        std::static_pointer_cast<CommandBars>(bars)->Remove(this);
    return {};
}

} // namespace

HostObject MakeCommandBars() {
    auto bars = std::make_shared<CommandBars>();
    bars->Add({Value("Menu bar")});
    return bars;
}

} // namespace tovimar::platform::access
