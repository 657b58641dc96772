#pragma once
// An event: what happened, when, where and who came.

#include "catalog/catalog_item.h"

class CAttendee
{
public:
    CAttendee() = default;
    explicit CAttendee(const std::string& name);
    const std::string& GetName() const { return m_name; }
    void SetName(const std::string& name);

private:
    std::string m_name;
};

class CEventItem : public CCatalogItem
{
public:
    CEventItem();

    // The event record, then the common item record.
    void Serialize(CArchive& ar) override;
    // "<event> was for <occasion>.", the dates and place, then the comments.
    void AppendTextLines(std::vector<std::string>& lines) const override;
    std::string GetMailText() const override;
    // Offers the event's text to the mail program.
    void Mail(CAppContext& context) override;
    // The "Event" dialog on a working copy of the fields.
    bool Edit(CAppContext& context) override;

    const std::string& GetEventName() const { return m_eventName; }
    void SetEventName(const std::string& name);
    CTime GetStartDate() const { return m_startDate; }
    void SetStartDate(CTime date) { m_startDate = date; }
    CTime GetEndDate() const { return m_endDate; }
    void SetEndDate(CTime date) { m_endDate = date; }
    const std::string& GetOccasion() const { return m_occasion; }
    void SetOccasion(const std::string& occasion);
    const std::string& GetLocation() const { return m_location; }
    void SetLocation(const std::string& location);
    const std::string& GetComments() const { return m_comments; }
    void SetComments(const std::string& comments) { m_comments = comments; }
    std::vector<CAttendee>& GetAttendees() { return m_attendees; }
    const std::vector<CAttendee>& GetAttendees() const { return m_attendees; }

private:
    std::string m_eventName;
    CTime m_startDate;
    CTime m_endDate;
    std::string m_occasion;
    std::string m_location;
    std::string m_comments;
    std::vector<CAttendee> m_attendees;
};
