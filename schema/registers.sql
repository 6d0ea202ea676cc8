-- Dated registers: roll, giving and weekly figures. Each has projects, dates, rows of a date and notes.

-- Roll projects.
CREATE TABLE [tbl_roll_project] (
    [roll_project_id] INTEGER PRIMARY KEY,
    [roll_project] TEXT,
    [position] INTEGER DEFAULT 0 NOT NULL
) STRICT;

-- One row for each roll project: its services and absence reasons, and what a double click and a scan give.
CREATE TABLE [tbl_roll_setup] (
    [roll_project_id] INTEGER PRIMARY KEY,
    [service1] TEXT,
    [service2] TEXT,
    [service3] TEXT,
    [service4] TEXT,
    [service5] TEXT,
    [service6] TEXT,
    [service7] TEXT,
    [absent1] TEXT,
    [absent2] TEXT,
    [absent3] TEXT,
    [absent4] TEXT,
    [include1] INTEGER DEFAULT 0 NOT NULL,
    [include2] INTEGER DEFAULT 0 NOT NULL,
    [include3] INTEGER DEFAULT 0 NOT NULL,
    [include4] INTEGER DEFAULT 0 NOT NULL,
    [mouse_service1] INTEGER DEFAULT 0 NOT NULL,
    [mouse_service2] INTEGER DEFAULT 0 NOT NULL,
    [mouse_service3] INTEGER DEFAULT 0 NOT NULL,
    [mouse_service4] INTEGER DEFAULT 0 NOT NULL,
    [mouse_service5] INTEGER DEFAULT 0 NOT NULL,
    [mouse_service6] INTEGER DEFAULT 0 NOT NULL,
    [mouse_service7] INTEGER DEFAULT 0 NOT NULL,
    [mouse_absent1] INTEGER DEFAULT 0 NOT NULL,
    [mouse_absent2] INTEGER DEFAULT 0 NOT NULL,
    [mouse_absent3] INTEGER DEFAULT 0 NOT NULL,
    [mouse_absent4] INTEGER DEFAULT 0 NOT NULL,
    [individual] INTEGER DEFAULT 0 NOT NULL,
    [bar_mouse_service1] INTEGER DEFAULT 0 NOT NULL,
    [bar_mouse_service2] INTEGER DEFAULT 0 NOT NULL,
    [bar_mouse_service3] INTEGER DEFAULT 0 NOT NULL,
    [bar_mouse_service4] INTEGER DEFAULT 0 NOT NULL,
    [bar_mouse_service5] INTEGER DEFAULT 0 NOT NULL,
    [bar_mouse_service6] INTEGER DEFAULT 0 NOT NULL,
    [bar_mouse_service7] INTEGER DEFAULT 0 NOT NULL,
    [bar_mouse_absent1] INTEGER DEFAULT 0 NOT NULL,
    [bar_mouse_absent2] INTEGER DEFAULT 0 NOT NULL,
    [bar_mouse_absent3] INTEGER DEFAULT 0 NOT NULL,
    [bar_mouse_absent4] INTEGER DEFAULT 0 NOT NULL,
    [bar_individual] INTEGER DEFAULT 0 NOT NULL,
    [memory_check] INTEGER DEFAULT 0 NOT NULL,
    [append_mode] INTEGER DEFAULT 0 NOT NULL
) STRICT;

CREATE TABLE [tbl_roll_date] (
    [roll_date_id] INTEGER PRIMARY KEY,
    [roll_date] TEXT,
    [roll_project_id] INTEGER NOT NULL
) STRICT;
CREATE UNIQUE INDEX [idx_roll_date_project] ON [tbl_roll_date] ([roll_project_id], [roll_date]);

-- Attendance holds a marker of 128 and the services from 64 down to 1, or the number of the absence below zero.
CREATE TABLE [tbl_roll_attendance] (
    [roll_date_id] INTEGER NOT NULL,
    [person_id] INTEGER NOT NULL,
    [Attendance] INTEGER NOT NULL,
    PRIMARY KEY ([roll_date_id], [person_id])
) STRICT;
CREATE INDEX [idx_roll_attendance_person] ON [tbl_roll_attendance] ([person_id], [roll_date_id]);

CREATE TABLE [tbl_roll_visitors] (
    [roll_date_id] INTEGER NOT NULL,
    [service_id] INTEGER NOT NULL,
    [visitors] INTEGER NOT NULL,
    PRIMARY KEY ([roll_date_id], [service_id])
) STRICT;

CREATE TABLE [tbl_roll_memo] (
    [roll_date_id] INTEGER PRIMARY KEY,
    [Notes] TEXT
) STRICT;

-- The preset keys of a project.
CREATE TABLE [Tbl_roll_pre_programmed_buttons] (
    [roll_project_id] INTEGER NOT NULL,
    [f_key_no] INTEGER NOT NULL,
    [service_1] INTEGER DEFAULT 0 NOT NULL,
    [service_2] INTEGER DEFAULT 0 NOT NULL,
    [service_3] INTEGER DEFAULT 0 NOT NULL,
    [service_4] INTEGER DEFAULT 0 NOT NULL,
    [service_5] INTEGER DEFAULT 0 NOT NULL,
    [service_6] INTEGER DEFAULT 0 NOT NULL,
    [service_7] INTEGER DEFAULT 0 NOT NULL,
    [absent_1] INTEGER DEFAULT 0 NOT NULL,
    [absent_2] INTEGER DEFAULT 0 NOT NULL,
    [absent_3] INTEGER DEFAULT 0 NOT NULL,
    [absent_4] INTEGER DEFAULT 0 NOT NULL,
    PRIMARY KEY ([roll_project_id], [f_key_no])
) STRICT;

-- Where the figures of a roll project last went: a weekly project, and a category for each service.
CREATE TABLE [Tbl_Roll_tansfer_values] (
    [roll_project_id] INTEGER PRIMARY KEY,
    [weekly_project] INTEGER,
    [attendance1] INTEGER,
    [attendance2] INTEGER,
    [attendance3] INTEGER,
    [attendance4] INTEGER,
    [attendance5] INTEGER,
    [attendance6] INTEGER,
    [attendance7] INTEGER
) STRICT;

-- Giving.
CREATE TABLE [tbl_finance_project] (
    [finance_project_id] INTEGER PRIMARY KEY,
    [finance_project] TEXT,
    [position] INTEGER DEFAULT 0 NOT NULL
) STRICT;

CREATE TABLE [tbl_finance_date] (
    [finance_date_id] INTEGER PRIMARY KEY,
    [finance_date] TEXT,
    [finance_project_id] INTEGER NOT NULL,
    [control_total] INTEGER                         -- what the counters of the collection found
) STRICT;
CREATE UNIQUE INDEX [idx_finance_date_project] ON [tbl_finance_date] ([finance_project_id], [finance_date]);

CREATE TABLE [tbl_finance_data] (
    [finance_date_id] INTEGER NOT NULL,
    [person_id] INTEGER NOT NULL,
    [Data] INTEGER NOT NULL,
    PRIMARY KEY ([finance_date_id], [person_id])
) STRICT;
CREATE INDEX [idx_finance_data_person] ON [tbl_finance_data] ([person_id], [finance_date_id]);

CREATE TABLE [tbl_finance_memo] (
    [finance_date_id] INTEGER PRIMARY KEY,
    [Notes] TEXT
) STRICT;

-- Weekly figures.
CREATE TABLE [tbl_weekly_project] (
    [weekly_project_id] INTEGER PRIMARY KEY,
    [weekly_project] TEXT,
    [position] INTEGER DEFAULT 0 NOT NULL
) STRICT;

CREATE TABLE [tbl_weekly_group] (
    [group_id] INTEGER PRIMARY KEY,
    [group] TEXT,
    [position] INTEGER DEFAULT 0 NOT NULL,
    [group_type] INTEGER NOT NULL,                  -- 1 attendance, 2 money
    [weekly_project_id] INTEGER NOT NULL
) STRICT;
CREATE INDEX [idx_weekly_group_project] ON [tbl_weekly_group] ([weekly_project_id], [group_type], [position]);

CREATE TABLE [tbl_weekly_date] (
    [weekly_date_id] INTEGER PRIMARY KEY,
    [weekly_date] TEXT,
    [weekly_project_id] INTEGER NOT NULL
) STRICT;
CREATE UNIQUE INDEX [idx_weekly_date_project] ON [tbl_weekly_date] ([weekly_project_id], [weekly_date]);

CREATE TABLE [tbl_weekly_amount] (
    [date_id] INTEGER NOT NULL,                     -- the weekly_date_id
    [group_id] INTEGER NOT NULL,
    [amount] INTEGER NOT NULL,
    PRIMARY KEY ([date_id], [group_id])
) STRICT;
CREATE INDEX [idx_weekly_amount_group] ON [tbl_weekly_amount] ([group_id], [date_id]);

CREATE TABLE [tbl_weekly_memo] (
    [weekly_date_id] INTEGER PRIMARY KEY,
    [Notes] TEXT
) STRICT;

-- The one row of projects last chosen on the entry and output pages, by key.
CREATE TABLE [tbl_project_position] (
    [position_id] INTEGER DEFAULT 1 NOT NULL PRIMARY KEY CHECK ([position_id] = 1),
    [roll_add_position] INTEGER,
    [roll_output_position] INTEGER,
    [finance_add_position] INTEGER,
    [finance_output_position] INTEGER,
    [weekly_add_position] INTEGER,
    [weekly_output_position] INTEGER
) STRICT;

INSERT INTO [tbl_project_position] ([position_id]) VALUES (1);
