-- The church itself: its settings, the key counters, the locks and the users.
--
-- One dialect for both engines. Dates are text YYYY-MM-DD (year 1800: not known), times are ISO text, yes/no is -1 and
-- 0, money and weekly figures are whole ten-thousandths. Empty text is stored as NULL.

-- The one row of church-wide settings.
CREATE TABLE [tbl_startup] (
    [startup_id] INTEGER DEFAULT 1 NOT NULL PRIMARY KEY CHECK ([startup_id] = 1),
    [Version] INTEGER DEFAULT 1 NOT NULL,               -- of this schema
    [network_Version] INTEGER DEFAULT 0 NOT NULL,       -- newest edition that any workstation has recorded
    [church_code] TEXT,                                 -- tells this church apart from every other
    [password_salt] TEXT,                               -- of all password hashes of this church
    [Security] INTEGER DEFAULT 0 NOT NULL,
    [autosave] INTEGER DEFAULT 0 NOT NULL,
    [audio_prompt] INTEGER DEFAULT 0 NOT NULL,
    [American_date] INTEGER DEFAULT 0 NOT NULL,
    [use_preferred_names] INTEGER DEFAULT 0 NOT NULL,
    [encrpted_notebook] INTEGER DEFAULT 0 NOT NULL,
    [follow_up] INTEGER DEFAULT 0 NOT NULL,
    [pin_auto_number_start] INTEGER DEFAULT 1 NOT NULL, -- next giving number to offer
    [compact_count] INTEGER DEFAULT 0 NOT NULL,         -- starts since the last compaction
    [Kindrel_address_position] INTEGER DEFAULT 1 NOT NULL,
    [search_position] INTEGER DEFAULT 1 NOT NULL,
    [backup_position] INTEGER DEFAULT 0 NOT NULL,
    -- Booked-out copies only.
    [booked_out_code] TEXT,                             -- the booking this copy belongs to
    [Booked_out_persons_name] TEXT,
    [booked_out_date] TEXT,
    -- The vision statement and the decoration of reports. An empty church_vision means the text of vision.
    [vision] TEXT,
    [church_vision] TEXT,
    [footer_vision] TEXT,
    [footer_vision_line2] TEXT,
    [Include_vision_reports] INTEGER DEFAULT 0 NOT NULL,
    [include_vision_footer] INTEGER DEFAULT 0 NOT NULL,
    [vision_font] TEXT DEFAULT 'Arial',
    [vision_font_size] INTEGER DEFAULT 10 NOT NULL,
    [vision_alignment] INTEGER DEFAULT 0 NOT NULL,      -- 0 left, 1 centre, 2 right
    [vision_format] INTEGER DEFAULT 0 NOT NULL,         -- 0 plain, 1 bold, 2 italic, 3 both
    [footer_line] INTEGER DEFAULT 0 NOT NULL,           -- rule above the footer
    [vision_line] INTEGER DEFAULT 0 NOT NULL,
    [vision_thick_line] INTEGER DEFAULT 0 NOT NULL,
    [title_date] INTEGER DEFAULT -1 NOT NULL,
    [title_filters] INTEGER DEFAULT 0 NOT NULL,
    [title_church] INTEGER DEFAULT -1 NOT NULL,
    [title_logo] INTEGER DEFAULT 0 NOT NULL,
    -- The tagging window for barcodes.
    [tag_barcode_option] INTEGER DEFAULT 0 NOT NULL,
    [tag_barcode_memory] INTEGER DEFAULT 0 NOT NULL,
    -- The two Wardline reminders.
    [schedule1_active] INTEGER DEFAULT 0 NOT NULL,
    [schedule1_compliance] INTEGER,
    [schedule1_event] INTEGER,
    [schedule1_days] INTEGER DEFAULT 0 NOT NULL,
    [schedule1_type] INTEGER DEFAULT 0 NOT NULL,
    [schedule2_active] INTEGER DEFAULT 0 NOT NULL,
    [schedule2_compliance] INTEGER,
    [schedule2_event] INTEGER,
    [schedule2_days] INTEGER DEFAULT 0 NOT NULL,
    [schedule2_type] INTEGER DEFAULT 0 NOT NULL
) STRICT;

INSERT INTO [tbl_startup] ([startup_id]) VALUES (1);

-- Church-wide settings that have no field of their own, by name.
CREATE TABLE [tbl_setting] (
    [setting] TEXT NOT NULL PRIMARY KEY,
    [value] TEXT
) STRICT;

-- Key counters: every row is one key that was handed out, the highest being the last.
CREATE TABLE [tbl_id_surname] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_person] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_group] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_status] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_ministry] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_individual_date] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_flexi] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_family_group] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_family_date] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_title] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_occupation] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_suburb] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_security] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_roll_date] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_roll_project] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_finance_project] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_weekly_project] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_weekly_group] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_weekly_date] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_finance_date] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_fusion] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_history] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_roster_project] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_roster_duty] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_roster_dates] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_roster_duty_people] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_roster_teams] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_master_duty] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_email_history] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_print_history] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_roster_memory] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_user_id] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_wardline_compliance] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_wardline_risk] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_wardline_status] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_wardline_reviews] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_wardline_procedure] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_wardline_event] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_wardline_comment] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_wardline_incident] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_wardline_document] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_wardline_application] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_wardline_referee] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_wardline_audit_risk] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_wardline_audit_status] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_wardline_audit_review] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_wardline_audit_incident] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_wardline_security] ([id_found] INTEGER PRIMARY KEY) STRICT;
CREATE TABLE [tbl_id_wardline_template] ([id_found] INTEGER PRIMARY KEY) STRICT;

-- Locks. A row is a lock. Two rows of one key are allowed, so none of these tables has a key.
CREATE TABLE [tbl_locked_area] (
    [locked_area] INTEGER, [workstation] TEXT, [process] INTEGER, [taken] TEXT
) STRICT;
CREATE TABLE [tbl_locked_family_files] (
    [surname_id] INTEGER, [workstation] TEXT, [process] INTEGER, [taken] TEXT
) STRICT;
CREATE TABLE [tbl_locked_roll_area] (
    [locked_id] INTEGER, [workstation] TEXT, [process] INTEGER, [taken] TEXT
) STRICT;
CREATE TABLE [tbl_locked_finance_area] (
    [locked_id] INTEGER, [workstation] TEXT, [process] INTEGER, [taken] TEXT
) STRICT;
CREATE TABLE [tbl_locked_roster_area] (
    [locked_id] INTEGER, [workstation] TEXT, [process] INTEGER, [taken] TEXT
) STRICT;
CREATE TABLE [tbl_locked_wardline_area] (
    [locked_id] INTEGER, [workstation] TEXT, [process] INTEGER, [taken] TEXT
) STRICT;
CREATE TABLE [tbl_roll_locked] (
    [roll_locked] INTEGER, [workstation] TEXT, [process] INTEGER, [taken] TEXT
) STRICT;
CREATE TABLE [tbl_finance_locked] (
    [finance_locked] INTEGER, [workstation] TEXT, [process] INTEGER, [taken] TEXT
) STRICT;
CREATE TABLE [tbl_weekly_locked] (
    [weekly_locked] INTEGER, [workstation] TEXT, [process] INTEGER, [taken] TEXT
) STRICT;
CREATE TABLE [tbl_roster_locked] (
    [roster_locked] INTEGER, [workstation] TEXT, [process] INTEGER, [taken] TEXT
) STRICT;
CREATE TABLE [tbl_wardline_locked] (
    [Wardline_locked] INTEGER, [workstation] TEXT, [process] INTEGER, [taken] TEXT
) STRICT;
CREATE TABLE [Tbl_custom_letter_lock] (
    [Letter] TEXT, [workstation] TEXT, [process] INTEGER, [taken] TEXT
) STRICT;
CREATE TABLE [Tbl_custom_report_lock] (
    [report] TEXT, [workstation] TEXT, [process] INTEGER, [taken] TEXT
) STRICT;

-- Users: one row for each access area of a password. The password is a hash.
CREATE TABLE [tbl_security] (
    [security_id] INTEGER PRIMARY KEY,
    [user_id] INTEGER NOT NULL,
    [password] TEXT,
    [area] TEXT,
    [people] TEXT,
    [email_name] TEXT,
    [email_address] TEXT
) STRICT;
CREATE INDEX [idx_security_user] ON [tbl_security] ([user_id]);
CREATE INDEX [idx_security_password] ON [tbl_security] ([password]);

-- Entries into the program.
CREATE TABLE [tbl_security_archive] (
    [user_id] INTEGER NOT NULL,
    [entered] TEXT NOT NULL
) STRICT;
CREATE INDEX [idx_security_archive_entered] ON [tbl_security_archive] ([entered]);

-- Recovery passwords, by their place in the fixed list, with the time of their only use.
CREATE TABLE [tbl_security_recovery] (
    [number] INTEGER PRIMARY KEY,
    [used] TEXT
) STRICT;
