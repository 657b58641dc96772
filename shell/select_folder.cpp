#include "shell/select_folder.h"

CSelectFolderLogic::CSelectFolderLogic(CSelectFolderFields& fields, VolumeType volumeType)
    : m_fields(fields), m_volumeType(std::move(volumeType))
{}

void CSelectFolderLogic::Open()
{
    m_fields.category = m_fields.baseCategory;
    m_fields.createSubCategories = true;
}

void CSelectFolderLogic::OnSelectionChanged(const std::string& path)
{
    m_fields.selectedFolder = path;
    const DriveType type = m_volumeType ? m_volumeType(path) : DriveType::Fixed;
    m_fields.fixedDrive = type == DriveType::Fixed || type == DriveType::RamDisk;
    m_fields.archiveMode = m_fields.fixedDrive ? m_fields.archiveFixed : m_fields.archiveRemovable;
}

void CSelectFolderLogic::OnNewCategoryChanged(const std::string& text)
{
    m_fields.newCategory = text;
    m_fields.category = !m_fields.baseCategory.empty() && !text.empty()
                            ? m_fields.baseCategory + "\\" + text
                            : m_fields.baseCategory;
}
