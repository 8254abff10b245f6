#pragma once

class PainterPathRenderer_Controller;
class ProjectController;
class ProjectFieldSink;

// Writes a document into an open container, in the order of the format.
class ProjectSaver
{
public:
    ProjectSaver(const PainterPathRenderer_Controller &document, ProjectController &store)
        : m_document(document), m_store(store)
    {
    }

    void write();

    // The document's own fields before the point lists (header to pseudo map
    // centre), and the exporter flag that follows them.
    static void writeLeadingFields(const PainterPathRenderer_Controller &document, ProjectFieldSink &sink);
    static void writeTrailingFields(const PainterPathRenderer_Controller &document, ProjectFieldSink &sink);

private:
    void writeKeyPoints();
    void writeSegments();
    void writeMediaPoints();
    void writeCurvePoints();

    const PainterPathRenderer_Controller &m_document;
    ProjectController &m_store;
};
