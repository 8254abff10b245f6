#pragma once

#include <QString>

#include <cstdint>
#include <vector>

class PainterPathRenderer_Controller;
class ProjectController;

// Reads a document from an open container, in the order of the format: later
// steps rely on what earlier ones have left. Missing keys keep the document's
// values; a damaged number throws DamagedNumberError.
class ProjectLoader
{
public:
    ProjectLoader(PainterPathRenderer_Controller &document, ProjectController &store)
        : m_document(document), m_store(store)
    {
    }

    void read();

private:
    void readPathKind();
    void readScene();
    void readViews();
    void readFlyIn();
    double readRouteFactor();
    void readLook();
    void readGeometry();
    // The section numbers of the key points read.
    std::vector<int32_t> readKeyPoints();
    void readSegments();
    void readMediaPoints();
    void convertOldRouteDuration(double routeFactor);

    QString text(const QString &section, const QString &key) const;

    PainterPathRenderer_Controller &m_document;
    ProjectController &m_store;
};
