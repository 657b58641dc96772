#include "catalog/event_item.h"

#include "catalog/archive.h"
#include "catalog/text_util.h"

CAttendee::CAttendee(const std::string& name) : m_name(OneLine(name)) {}

void CAttendee::SetName(const std::string& name)
{
    m_name = OneLine(name);
}

CEventItem::CEventItem() : CCatalogItem(kKindEvent) {}

void CEventItem::Serialize(CArchive& ar)
{
    ar.Line(m_eventName);
    ar.Line(m_location);
    ar.Line(m_occasion);
    ar.CountedText(m_comments);
    ar.Time(m_startDate);
    ar.Time(m_endDate);
    if (ar.IsStoring()) {
        ar.WriteInt(static_cast<int32_t>(m_attendees.size()));
        for (const CAttendee& attendee : m_attendees)
            ar.WriteLine(attendee.GetName());
    } else {
        m_attendees.clear();
        const int32_t count = ar.ReadCount(1, "attendee");
        for (int32_t i = 0; i < count; ++i)
            m_attendees.emplace_back(ar.ReadLine());
    }
    CCatalogItem::Serialize(ar);
}

void CEventItem::AppendTextLines(std::vector<std::string>& lines) const
{
    lines.push_back(StrFormat("%s was for %s.", m_eventName.c_str(), m_occasion.c_str()));
    lines.push_back(StrFormat("The event took place between %s and %s at %s.",
                              m_startDate.Format("%B %d %Y").c_str(),
                              m_endDate.Format("%B %d %Y").c_str(), m_location.c_str()));
    for (std::string& line : SplitCrLfLines(m_comments))
        lines.push_back(std::move(line));
}

std::string CEventItem::GetMailText() const
{
    std::vector<std::string> lines;
    AppendTextLines(lines);
    std::string text;
    for (size_t i = 0; i < lines.size(); ++i) {
        if (i > 0)
            text += '\n';
        text += lines[i];
    }
    return text;
}

void CEventItem::SetEventName(const std::string& name)
{
    m_eventName = OneLine(name);
}

void CEventItem::SetOccasion(const std::string& occasion)
{
    m_occasion = OneLine(occasion);
}

void CEventItem::SetLocation(const std::string& location)
{
    m_location = OneLine(location);
}
