-- Wardline: the records of people who work with children, by compliance type.

CREATE TABLE [tbl_wardline_compliance] (
    [compliance_id] INTEGER PRIMARY KEY,
    [compliance] TEXT,
    [position] INTEGER DEFAULT 0 NOT NULL
) STRICT;

-- The lists of a compliance type.
CREATE TABLE [tbl_wardline_risk] (
    [risk_id] INTEGER PRIMARY KEY,
    [risk] TEXT,
    [position] INTEGER DEFAULT 0 NOT NULL,
    [compliance_id] INTEGER NOT NULL
) STRICT;
CREATE INDEX [idx_wardline_risk_compliance] ON [tbl_wardline_risk] ([compliance_id], [position]);

CREATE TABLE [tbl_wardline_status] (
    [status_id] INTEGER PRIMARY KEY,
    [status] TEXT,
    [position] INTEGER DEFAULT 0 NOT NULL,
    [compliance_id] INTEGER NOT NULL
) STRICT;
CREATE INDEX [idx_wardline_status_compliance] ON [tbl_wardline_status] ([compliance_id], [position]);

CREATE TABLE [tbl_wardline_reviews] (
    [reviews_id] INTEGER PRIMARY KEY,
    [reviews] TEXT,
    [position] INTEGER DEFAULT 0 NOT NULL,
    [compliance_id] INTEGER NOT NULL
) STRICT;
CREATE INDEX [idx_wardline_reviews_compliance] ON [tbl_wardline_reviews] ([compliance_id], [position]);

CREATE TABLE [tbl_wardline_procedure] (
    [procedure_id] INTEGER PRIMARY KEY,
    [procedure] TEXT,
    [position] INTEGER DEFAULT 0 NOT NULL,
    [compliance_id] INTEGER NOT NULL
) STRICT;
CREATE INDEX [idx_wardline_procedure_compliance] ON [tbl_wardline_procedure] ([compliance_id], [position]);

CREATE TABLE [tbl_wardline_event] (
    [event_id] INTEGER PRIMARY KEY,
    [event] TEXT,
    [position] INTEGER DEFAULT 0 NOT NULL,
    [compliance_id] INTEGER NOT NULL
) STRICT;
CREATE INDEX [idx_wardline_event_compliance] ON [tbl_wardline_event] ([compliance_id], [position]);

CREATE TABLE [tbl_wardline_comment] (
    [comment_id] INTEGER PRIMARY KEY,
    [comment] TEXT,
    [position] INTEGER DEFAULT 0 NOT NULL,
    [compliance_id] INTEGER NOT NULL
) STRICT;
CREATE INDEX [idx_wardline_comment_compliance] ON [tbl_wardline_comment] ([compliance_id], [position]);

-- Kinds of incident.
CREATE TABLE [tbl_wardline_incident] (
    [incident_id] INTEGER PRIMARY KEY,
    [Incident] TEXT,
    [Incident_date] TEXT,
    [position] INTEGER DEFAULT 0 NOT NULL,
    [compliance_id] INTEGER NOT NULL
) STRICT;
CREATE INDEX [idx_wardline_incident_compliance] ON [tbl_wardline_incident] ([compliance_id], [position]);

-- The file of a person under a compliance type.
CREATE TABLE [tbl_wardline_store_active_people] (
    [person_id] INTEGER NOT NULL,
    [compliance_id] INTEGER NOT NULL,
    PRIMARY KEY ([compliance_id], [person_id])
) STRICT;
CREATE INDEX [idx_wardline_store_active_people_person] ON [tbl_wardline_store_active_people] ([person_id]);

CREATE TABLE [tbl_wardline_store_risk] (
    [compliance_id] INTEGER NOT NULL,
    [person_id] INTEGER NOT NULL,
    [risk_id] INTEGER NOT NULL,
    PRIMARY KEY ([compliance_id], [person_id])
) STRICT;
CREATE INDEX [idx_wardline_store_risk_person] ON [tbl_wardline_store_risk] ([person_id]);
CREATE INDEX [idx_wardline_store_risk_item] ON [tbl_wardline_store_risk] ([risk_id]);

CREATE TABLE [tbl_wardline_store_status] (
    [compliance_id] INTEGER NOT NULL,
    [person_id] INTEGER NOT NULL,
    [status_id] INTEGER NOT NULL,
    PRIMARY KEY ([compliance_id], [person_id])
) STRICT;
CREATE INDEX [idx_wardline_store_status_person] ON [tbl_wardline_store_status] ([person_id]);
CREATE INDEX [idx_wardline_store_status_item] ON [tbl_wardline_store_status] ([status_id]);

CREATE TABLE [tbl_wardline_store_reviews] (
    [compliance_id] INTEGER NOT NULL,
    [person_id] INTEGER NOT NULL,
    [reviews_id] INTEGER NOT NULL,
    PRIMARY KEY ([compliance_id], [person_id], [reviews_id])
) STRICT;
CREATE INDEX [idx_wardline_store_reviews_person] ON [tbl_wardline_store_reviews] ([person_id]);
CREATE INDEX [idx_wardline_store_reviews_item] ON [tbl_wardline_store_reviews] ([reviews_id]);

CREATE TABLE [tbl_wardline_store_procedure] (
    [compliance_id] INTEGER NOT NULL,
    [person_id] INTEGER NOT NULL,
    [procedure_id] INTEGER NOT NULL,
    [Yes] INTEGER DEFAULT 0 NOT NULL,
    PRIMARY KEY ([compliance_id], [person_id], [procedure_id])
) STRICT;
CREATE INDEX [idx_wardline_store_procedure_person] ON [tbl_wardline_store_procedure] ([person_id]);
CREATE INDEX [idx_wardline_store_procedure_item] ON [tbl_wardline_store_procedure] ([procedure_id]);

CREATE TABLE [tbl_wardline_store_event] (
    [compliance_id] INTEGER NOT NULL,
    [person_id] INTEGER NOT NULL,
    [event_id] INTEGER NOT NULL,
    [event_date] TEXT,
    PRIMARY KEY ([compliance_id], [person_id], [event_id])
) STRICT;
CREATE INDEX [idx_wardline_store_event_person] ON [tbl_wardline_store_event] ([person_id]);
CREATE INDEX [idx_wardline_store_event_item] ON [tbl_wardline_store_event] ([event_id], [event_date]);

CREATE TABLE [tbl_wardline_store_comment] (
    [compliance_id] INTEGER NOT NULL,
    [person_id] INTEGER NOT NULL,
    [comment_id] INTEGER NOT NULL,
    [description] TEXT,
    PRIMARY KEY ([compliance_id], [person_id], [comment_id])
) STRICT;
CREATE INDEX [idx_wardline_store_comment_person] ON [tbl_wardline_store_comment] ([person_id]);
CREATE INDEX [idx_wardline_store_comment_item] ON [tbl_wardline_store_comment] ([comment_id]);

CREATE TABLE [tbl_wardline_store_notes] (
    [compliance_id] INTEGER NOT NULL,
    [person_id] INTEGER NOT NULL,
    [Notes] TEXT,
    PRIMARY KEY ([compliance_id], [person_id])
) STRICT;
CREATE INDEX [idx_wardline_store_notes_person] ON [tbl_wardline_store_notes] ([person_id]);

CREATE TABLE [tbl_wardline_store_document] (
    [document_id] INTEGER PRIMARY KEY,
    [compliance_id] INTEGER NOT NULL,
    [person_id] INTEGER NOT NULL,
    [file_title] TEXT,
    [file_name] TEXT,
    [added_by] TEXT,
    [added_time] TEXT
) STRICT;
CREATE INDEX [idx_wardline_store_document_person] ON [tbl_wardline_store_document] ([person_id], [compliance_id]);
CREATE INDEX [idx_wardline_store_document_compliance] ON [tbl_wardline_store_document] ([compliance_id]);
CREATE UNIQUE INDEX [idx_wardline_store_document_title] ON [tbl_wardline_store_document] ([file_title]);
CREATE UNIQUE INDEX [idx_wardline_store_document_file] ON [tbl_wardline_store_document] ([file_name]);

-- Applications, referee checks and incidents, each with its details in a row of their own.
CREATE TABLE [tbl_wardline_application_records] (
    [application_id] INTEGER PRIMARY KEY,
    [compliance_id] INTEGER NOT NULL,
    [person_id] INTEGER NOT NULL,
    [Application_date] TEXT
) STRICT;
CREATE INDEX [idx_wardline_application_records_person]
    ON [tbl_wardline_application_records] ([person_id], [compliance_id]);
CREATE INDEX [idx_wardline_application_records_compliance] ON [tbl_wardline_application_records] ([compliance_id]);

CREATE TABLE [tbl_wardline_application_details] (
    [application_id] INTEGER PRIMARY KEY,
    [compliance_id] INTEGER NOT NULL,
    [person_id] INTEGER NOT NULL,
    [approval] INTEGER DEFAULT 0 NOT NULL,          -- 0 undecided, -1 approved, 1 declined
    [approved_by] TEXT,
    [Notes] TEXT
) STRICT;
CREATE INDEX [idx_wardline_application_details_person]
    ON [tbl_wardline_application_details] ([person_id], [compliance_id]);
CREATE INDEX [idx_wardline_application_details_compliance] ON [tbl_wardline_application_details] ([compliance_id]);

CREATE TABLE [tbl_wardline_referee_records] (
    [referee_id] INTEGER PRIMARY KEY,
    [compliance_id] INTEGER NOT NULL,
    [person_id] INTEGER NOT NULL,
    [referee_date] TEXT
) STRICT;
CREATE INDEX [idx_wardline_referee_records_person] ON [tbl_wardline_referee_records] ([person_id], [compliance_id]);
CREATE INDEX [idx_wardline_referee_records_compliance] ON [tbl_wardline_referee_records] ([compliance_id]);

CREATE TABLE [tbl_wardline_referee_details] (
    [referee_id] INTEGER PRIMARY KEY,
    [compliance_id] INTEGER NOT NULL,
    [person_id] INTEGER NOT NULL,
    [given_name] TEXT,
    [surname] TEXT,
    [phone] TEXT,
    [Address] TEXT,
    [Notes] TEXT
) STRICT;
CREATE INDEX [idx_wardline_referee_details_person] ON [tbl_wardline_referee_details] ([person_id], [compliance_id]);
CREATE INDEX [idx_wardline_referee_details_compliance] ON [tbl_wardline_referee_details] ([compliance_id]);

CREATE TABLE [tbl_wardline_incident_records] (
    [incident_id_in] INTEGER PRIMARY KEY,
    [compliance_id] INTEGER NOT NULL,
    [person_id] INTEGER NOT NULL,
    [incident_id] INTEGER,                          -- kind of incident
    [Incident_date] TEXT,
    [Date] TEXT,                                    -- of the last save
    [Status] TEXT
) STRICT;
CREATE INDEX [idx_wardline_incident_records_person] ON [tbl_wardline_incident_records] ([person_id], [compliance_id]);
CREATE INDEX [idx_wardline_incident_records_compliance] ON [tbl_wardline_incident_records] ([compliance_id]);
CREATE INDEX [idx_wardline_incident_records_item] ON [tbl_wardline_incident_records] ([incident_id]);

CREATE TABLE [tbl_wardline_incident_details] (
    [incident_id_in] INTEGER PRIMARY KEY,
    [compliance_id] INTEGER NOT NULL,
    [person_id] INTEGER NOT NULL,
    [Incident_time] TEXT,
    [Recorded_date] TEXT,
    [Recorded_time] TEXT,
    [Incident_status] TEXT,
    [recorded_by] TEXT,
    [Investigated_by] TEXT,
    [Incident_reported] TEXT,
    [People_involved] TEXT,
    [Conclusion] TEXT
) STRICT;
CREATE INDEX [idx_wardline_incident_details_person] ON [tbl_wardline_incident_details] ([person_id], [compliance_id]);
CREATE INDEX [idx_wardline_incident_details_compliance] ON [tbl_wardline_incident_details] ([compliance_id]);

-- Changes, by whom and when. An item of 0 says that nothing was chosen any more. The rows outlive items and people.
CREATE TABLE [tbl_wardline_audit_risk] (
    [audit_id] INTEGER PRIMARY KEY,
    [compliance_id] INTEGER NOT NULL,
    [person_id] INTEGER NOT NULL,
    [risk_id] INTEGER DEFAULT 0 NOT NULL,
    [user_name] TEXT,
    [date] TEXT
) STRICT;
CREATE INDEX [idx_wardline_audit_risk_person] ON [tbl_wardline_audit_risk] ([person_id], [compliance_id]);
CREATE INDEX [idx_wardline_audit_risk_compliance] ON [tbl_wardline_audit_risk] ([compliance_id]);

CREATE TABLE [tbl_wardline_audit_status] (
    [audit_id] INTEGER PRIMARY KEY,
    [compliance_id] INTEGER NOT NULL,
    [person_id] INTEGER NOT NULL,
    [status_id] INTEGER DEFAULT 0 NOT NULL,
    [user_name] TEXT,
    [date] TEXT
) STRICT;
CREATE INDEX [idx_wardline_audit_status_person] ON [tbl_wardline_audit_status] ([person_id], [compliance_id]);
CREATE INDEX [idx_wardline_audit_status_compliance] ON [tbl_wardline_audit_status] ([compliance_id]);

CREATE TABLE [tbl_wardline_audit_review] (
    [audit_id] INTEGER PRIMARY KEY,
    [compliance_id] INTEGER NOT NULL,
    [person_id] INTEGER NOT NULL,
    [review_id] INTEGER DEFAULT 0 NOT NULL,         -- reviews_id elsewhere
    [user_name] TEXT,
    [date] TEXT
) STRICT;
CREATE INDEX [idx_wardline_audit_review_person] ON [tbl_wardline_audit_review] ([person_id], [compliance_id]);
CREATE INDEX [idx_wardline_audit_review_compliance] ON [tbl_wardline_audit_review] ([compliance_id]);

CREATE TABLE [tbl_wardline_audit_incident] (
    [audit_id] INTEGER PRIMARY KEY,
    [compliance_id] INTEGER NOT NULL,
    [person_id] INTEGER NOT NULL,
    [incident_id] INTEGER DEFAULT 0 NOT NULL,       -- kind of incident
    [incident_id_in] INTEGER,                       -- the record
    [Incident_date] TEXT,
    [Incident_status] TEXT,
    [user_name] TEXT,
    [date] TEXT
) STRICT;
CREATE INDEX [idx_wardline_audit_incident_person] ON [tbl_wardline_audit_incident] ([person_id], [compliance_id]);
CREATE INDEX [idx_wardline_audit_incident_compliance] ON [tbl_wardline_audit_incident] ([compliance_id]);

-- Users of Wardline. The password alone tells who enters, and is a hash.
CREATE TABLE [tbl_wardline_security] (
    [user_name] TEXT NOT NULL PRIMARY KEY,
    [user_password] TEXT,
    [authority] INTEGER DEFAULT 0 NOT NULL,
    [available1] INTEGER DEFAULT 0 NOT NULL,
    [available2] INTEGER DEFAULT 0 NOT NULL,
    [available3] INTEGER DEFAULT 0 NOT NULL,
    [available4] INTEGER DEFAULT 0 NOT NULL,
    [available5] INTEGER DEFAULT 0 NOT NULL,
    [available6] INTEGER DEFAULT 0 NOT NULL,
    [remove] INTEGER DEFAULT 0 NOT NULL,
    [document] INTEGER DEFAULT 0 NOT NULL,
    [schedule] INTEGER DEFAULT 0 NOT NULL,
    [audit_remove] INTEGER DEFAULT 0 NOT NULL,
    [Application] INTEGER DEFAULT 0 NOT NULL,
    [Reports] INTEGER DEFAULT 0 NOT NULL
) STRICT;

-- Entries into Wardline.
CREATE TABLE [tbl_wardline_security_archive] (
    [security_id] INTEGER PRIMARY KEY,
    [user_name] TEXT,
    [entered] TEXT,
    [Exit] TEXT
) STRICT;

-- What the area shows on entry.
CREATE TABLE [tbl_Wardline_startup] (
    [startup_id] INTEGER DEFAULT 1 NOT NULL PRIMARY KEY CHECK ([startup_id] = 1),
    [startup_option] INTEGER DEFAULT 0 NOT NULL,
    [compliance_choice] INTEGER,
    [risk_choice] INTEGER,
    [status_choice] INTEGER,
    [review_choice] INTEGER
) STRICT;

INSERT INTO [tbl_Wardline_startup] ([startup_id]) VALUES (1);

-- Layouts of reports, flat reports and exports, with the items chosen for each. Their keys come from one counter.
CREATE TABLE [tbl_wardline_template] (
    [template_id] INTEGER PRIMARY KEY,
    [template_name] TEXT,
    [compliance_id] INTEGER
) STRICT;
CREATE INDEX [idx_wardline_template_compliance] ON [tbl_wardline_template] ([compliance_id]);

CREATE TABLE [tbl_wardline_template_data] (
    [template_id] INTEGER NOT NULL,
    [area] TEXT NOT NULL,
    [area_id] INTEGER NOT NULL,
    [Active] INTEGER DEFAULT 0 NOT NULL,
    [position] INTEGER DEFAULT 0 NOT NULL,
    PRIMARY KEY ([template_id], [area], [area_id])
) STRICT;

CREATE TABLE [tbl_wardline_flat_template] (
    [template_id] INTEGER PRIMARY KEY,
    [template_name] TEXT,
    [compliance_id] INTEGER
) STRICT;
CREATE INDEX [idx_wardline_flat_template_compliance] ON [tbl_wardline_flat_template] ([compliance_id]);

CREATE TABLE [tbl_wardline_flat_template_data] (
    [template_id] INTEGER NOT NULL,
    [area] TEXT NOT NULL,
    [area_id] INTEGER NOT NULL,
    [Active] INTEGER DEFAULT 0 NOT NULL,
    [position] INTEGER DEFAULT 0 NOT NULL,
    PRIMARY KEY ([template_id], [area], [area_id])
) STRICT;

CREATE TABLE [tbl_wardline_export_template] (
    [template_id] INTEGER PRIMARY KEY,
    [template_name] TEXT,
    [compliance_id] INTEGER
) STRICT;
CREATE INDEX [idx_wardline_export_template_compliance] ON [tbl_wardline_export_template] ([compliance_id]);

CREATE TABLE [tbl_wardline_export_template_data] (
    [template_id] INTEGER NOT NULL,
    [area] TEXT NOT NULL,
    [area_id] INTEGER NOT NULL,
    [Active] INTEGER DEFAULT 0 NOT NULL,
    [position] INTEGER DEFAULT 0 NOT NULL,
    PRIMARY KEY ([template_id], [area], [area_id])
) STRICT;
