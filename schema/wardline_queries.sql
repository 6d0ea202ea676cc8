-- Stored queries over Wardline.

CREATE VIEW [qry_wardline_load_compliance] AS
SELECT [compliance_id], [compliance], [position] FROM [tbl_wardline_compliance] ORDER BY [position], [compliance_id];

CREATE VIEW [qry_wardline_load_risk] AS
SELECT [risk_id], [risk], [position], [compliance_id] FROM [tbl_wardline_risk] ORDER BY [position], [risk_id];

CREATE VIEW [qry_wardline_load_status] AS
SELECT [status_id], [status], [position], [compliance_id] FROM [tbl_wardline_status] ORDER BY [position], [status_id];

CREATE VIEW [qry_wardline_load_reviews] AS
SELECT [reviews_id], [reviews], [position], [compliance_id] FROM [tbl_wardline_reviews]
ORDER BY [position], [reviews_id];

CREATE VIEW [qry_wardline_load_procedure] AS
SELECT [procedure_id], [procedure], [position], [compliance_id] FROM [tbl_wardline_procedure]
ORDER BY [position], [procedure_id];

CREATE VIEW [qry_wardline_load_event] AS
SELECT [event_id], [event], [position], [compliance_id] FROM [tbl_wardline_event] ORDER BY [position], [event_id];

CREATE VIEW [qry_wardline_load_comment] AS
SELECT [comment_id], [comment], [position], [compliance_id] FROM [tbl_wardline_comment]
ORDER BY [position], [comment_id];

CREATE VIEW [qry_wardline_load_incident] AS
SELECT [incident_id], [Incident], [Incident_date], [position], [compliance_id] FROM [tbl_wardline_incident]
ORDER BY [position], [incident_id];

-- What the start-up reminders say.
CREATE VIEW [qry_wardline_schedule_details] AS
SELECT e.[event_id], e.[event], e.[compliance_id], c.[compliance]
FROM [tbl_wardline_event] e
JOIN [tbl_wardline_compliance] c ON c.[compliance_id] = e.[compliance_id];

CREATE VIEW [qry_wardline_schedule_names] AS
SELECT p.[person_id], p.[Surname_ID], f.[surname], p.[Name], p.[preferred_name], p.[Preferred_Name_hidden],
    f.[Primary_name], p.[position], p.[Decease], f.[Condition], p.[sort_key]
FROM [tbl_people] p
JOIN [tbl_surname] f ON f.[Surname_ID] = p.[Surname_ID];

-- Changes in their order. An item without a text has been removed from its list.
CREATE VIEW [qry_wardline_audit_risk] AS
SELECT a.[audit_id], a.[compliance_id], a.[person_id], a.[risk_id], i.[risk], a.[user_name], a.[date]
FROM [tbl_wardline_audit_risk] a
LEFT JOIN [tbl_wardline_risk] i ON i.[risk_id] = a.[risk_id]
ORDER BY a.[audit_id];

CREATE VIEW [qry_wardline_audit_status] AS
SELECT a.[audit_id], a.[compliance_id], a.[person_id], a.[status_id], i.[status], a.[user_name], a.[date]
FROM [tbl_wardline_audit_status] a
LEFT JOIN [tbl_wardline_status] i ON i.[status_id] = a.[status_id]
ORDER BY a.[audit_id];

CREATE VIEW [qry_wardline_audit_review] AS
SELECT a.[audit_id], a.[compliance_id], a.[person_id], a.[review_id], i.[reviews], a.[user_name], a.[date]
FROM [tbl_wardline_audit_review] a
LEFT JOIN [tbl_wardline_reviews] i ON i.[reviews_id] = a.[review_id]
ORDER BY a.[audit_id];

CREATE VIEW [qry_wardline_audit_incident] AS
SELECT a.[audit_id], a.[compliance_id], a.[person_id], a.[incident_id], a.[incident_id_in], i.[Incident],
    a.[Incident_date], a.[Incident_status], a.[user_name], a.[date]
FROM [tbl_wardline_audit_incident] a
LEFT JOIN [tbl_wardline_incident] i ON i.[incident_id] = a.[incident_id]
ORDER BY a.[audit_id];

CREATE VIEW [qry_Wardline_Document_all_view] AS
SELECT d.[document_id], d.[compliance_id], d.[person_id], d.[file_title], d.[file_name], d.[added_by], d.[added_time],
    p.[Surname_ID], f.[surname], p.[Name], p.[preferred_name], p.[Preferred_Name_hidden]
FROM [tbl_wardline_store_document] d
LEFT JOIN [tbl_people] p ON p.[person_id] = d.[person_id]
LEFT JOIN [tbl_surname] f ON f.[Surname_ID] = p.[Surname_ID]
ORDER BY d.[file_title], d.[document_id];

CREATE VIEW [qry_wardline_incident_export] AS
SELECT r.[compliance_id], r.[person_id], r.[incident_id_in], r.[incident_id], i.[Incident], r.[Incident_date],
    r.[Status], d.[Incident_status]
FROM [tbl_wardline_incident_records] r
LEFT JOIN [tbl_wardline_incident] i ON i.[incident_id] = r.[incident_id]
LEFT JOIN [tbl_wardline_incident_details] d ON d.[incident_id_in] = r.[incident_id_in]
ORDER BY r.[Incident_date], r.[incident_id_in];
