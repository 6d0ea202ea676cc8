-- Rosters. Weekdays are numbered 1 Sunday to 7 Saturday.

CREATE TABLE [tbl_roster_project] (
    [roster_project_id] INTEGER PRIMARY KEY,
    [roster_project] TEXT,
    [position] INTEGER DEFAULT 0 NOT NULL,
    [active_in_view] INTEGER DEFAULT 0 NOT NULL
) STRICT;

-- Names shared by like duties of several projects.
CREATE TABLE [tbl_roster_master_duty] (
    [master_duty_id] INTEGER PRIMARY KEY,
    [master_duty] TEXT,
    [position] INTEGER DEFAULT 0 NOT NULL
) STRICT;

CREATE TABLE [tbl_roster_duty] (
    [duty_id] INTEGER PRIMARY KEY,
    [roster_project_id] INTEGER NOT NULL,
    [duty] TEXT,
    [position] INTEGER DEFAULT 0 NOT NULL,
    [master_duty_id] INTEGER,
    [max_people] INTEGER DEFAULT 0 NOT NULL,
    [max_team] INTEGER DEFAULT 0 NOT NULL,
    [Frequency] INTEGER DEFAULT 0 NOT NULL,         -- weeks between dates less one
    [frequency_start] TEXT,
    [pattern_pos] INTEGER DEFAULT 1 NOT NULL,       -- 1 every so many weeks, 2 chosen weeks of the month
    [one] INTEGER DEFAULT 0 NOT NULL,
    [two] INTEGER DEFAULT 0 NOT NULL,
    [three] INTEGER DEFAULT 0 NOT NULL,
    [four] INTEGER DEFAULT 0 NOT NULL,
    [five] INTEGER DEFAULT 0 NOT NULL,
    [p_day] INTEGER DEFAULT 1 NOT NULL,
    [Sunday] INTEGER DEFAULT -1 NOT NULL,
    [Monday] INTEGER DEFAULT -1 NOT NULL,
    [Tuesday] INTEGER DEFAULT -1 NOT NULL,
    [Wednesday] INTEGER DEFAULT -1 NOT NULL,
    [Thursday] INTEGER DEFAULT -1 NOT NULL,
    [Friday] INTEGER DEFAULT -1 NOT NULL,
    [Saturday] INTEGER DEFAULT -1 NOT NULL
) STRICT;
CREATE INDEX [idx_roster_duty_project] ON [tbl_roster_duty] ([roster_project_id], [position]);
CREATE INDEX [idx_roster_duty_master] ON [tbl_roster_duty] ([master_duty_id]);

-- People of duty_id are to be given duty_do on the same date.
CREATE TABLE [tbl_roster_duty_do] (
    [duty_id] INTEGER NOT NULL,
    [duty_do] INTEGER NOT NULL,
    PRIMARY KEY ([duty_id], [duty_do])
) STRICT;
CREATE INDEX [idx_roster_duty_do_other] ON [tbl_roster_duty_do] ([duty_do]);

-- People of duty_dont_do must not get duty_id on the same date.
CREATE TABLE [tbl_roster_duty_dont_do] (
    [duty_id] INTEGER NOT NULL,
    [duty_dont_do] INTEGER NOT NULL,
    PRIMARY KEY ([duty_id], [duty_dont_do])
) STRICT;
CREATE INDEX [idx_roster_duty_dont_do_other] ON [tbl_roster_duty_dont_do] ([duty_dont_do]);

CREATE TABLE [tbl_roster_date] (
    [date_id] INTEGER PRIMARY KEY,
    [roster_project_id] INTEGER NOT NULL,
    [date] TEXT
) STRICT;
CREATE UNIQUE INDEX [idx_roster_date_project] ON [tbl_roster_date] ([roster_project_id], [date]);
CREATE INDEX [idx_roster_date_date] ON [tbl_roster_date] ([date]);

-- Working list of dates while they are generated and viewed.
CREATE TABLE [tbl_roster_date_sort] (
    [roster_project_id] INTEGER DEFAULT 0 NOT NULL,
    [date_sort] TEXT NOT NULL,
    PRIMARY KEY ([roster_project_id], [date_sort])
) STRICT;

-- A person on a duty, with when the person can serve there and how the roster shows the person.
CREATE TABLE [tbl_roster_people] (
    [roster_people_id] INTEGER PRIMARY KEY,
    [duty_id] INTEGER NOT NULL,
    [person_id] INTEGER NOT NULL,
    [position] INTEGER DEFAULT 0 NOT NULL,
    [display] TEXT,                                 -- name shown in place of the person's own
    [add_family] INTEGER DEFAULT 0 NOT NULL,        -- the whole family serves
    [substitute] TEXT,                              -- who steps in
    [Sunday] INTEGER DEFAULT -1 NOT NULL,
    [Monday] INTEGER DEFAULT -1 NOT NULL,
    [Tuesday] INTEGER DEFAULT -1 NOT NULL,
    [Wednesday] INTEGER DEFAULT -1 NOT NULL,
    [Thursday] INTEGER DEFAULT -1 NOT NULL,
    [Friday] INTEGER DEFAULT -1 NOT NULL,
    [Saturday] INTEGER DEFAULT -1 NOT NULL,
    [absent_day] INTEGER DEFAULT 0 NOT NULL,
    [absent_1st] INTEGER DEFAULT 0 NOT NULL,
    [absent_2nd] INTEGER DEFAULT 0 NOT NULL,
    [absent_3rd] INTEGER DEFAULT 0 NOT NULL,
    [absent_4th] INTEGER DEFAULT 0 NOT NULL,
    [absent_5th] INTEGER DEFAULT 0 NOT NULL,
    [every_week] INTEGER DEFAULT 0 NOT NULL,        -- weeks of a cycle less one
    [every_day] INTEGER DEFAULT 0 NOT NULL,         -- weeks away in each cycle less one
    [every_start] TEXT,                             -- unset: no cycle
    [every_Sunday] INTEGER DEFAULT 0 NOT NULL,
    [every_Monday] INTEGER DEFAULT 0 NOT NULL,
    [every_Tuesday] INTEGER DEFAULT 0 NOT NULL,
    [every_Wednesday] INTEGER DEFAULT 0 NOT NULL,
    [every_Thursday] INTEGER DEFAULT 0 NOT NULL,
    [every_Friday] INTEGER DEFAULT 0 NOT NULL,
    [every_Saturday] INTEGER DEFAULT 0 NOT NULL,
    [people_max] INTEGER DEFAULT 0 NOT NULL,
    [people_priority_frequency] INTEGER DEFAULT 0 NOT NULL
) STRICT;
CREATE UNIQUE INDEX [idx_roster_people_duty] ON [tbl_roster_people] ([duty_id], [person_id]);
CREATE INDEX [idx_roster_people_person] ON [tbl_roster_people] ([person_id]);

CREATE TABLE [tbl_roster_absence] (
    [roster_people_id] INTEGER NOT NULL,
    [absent_from] TEXT,
    [absent_to] TEXT
) STRICT;
CREATE INDEX [idx_roster_absence_people] ON [tbl_roster_absence] ([roster_people_id], [absent_from]);

CREATE TABLE [tbl_roster_team] (
    [team_id] INTEGER PRIMARY KEY,
    [duty_id] INTEGER NOT NULL,
    [team] TEXT,
    [position] INTEGER DEFAULT 0 NOT NULL,
    [team_max] INTEGER DEFAULT 0 NOT NULL,
    [team_priority_frequency] INTEGER DEFAULT 0 NOT NULL,
    [team_leader_phone] TEXT,
    [team_leader_out_of_group] INTEGER DEFAULT 0 NOT NULL,
    [team_leader_name] TEXT,                        -- a leader who is not on the duty
    [info] TEXT
) STRICT;
CREATE INDEX [idx_roster_team_duty] ON [tbl_roster_team] ([duty_id], [position]);

CREATE TABLE [tbl_roster_team_setup] (
    [team_id] INTEGER NOT NULL,
    [roster_people_id] INTEGER NOT NULL,
    [team_leader] INTEGER DEFAULT 0 NOT NULL,
    PRIMARY KEY ([team_id], [roster_people_id])
) STRICT;
CREATE INDEX [idx_roster_team_setup_people] ON [tbl_roster_team_setup] ([roster_people_id]);

-- Associations. Both sides are people on duties.
CREATE TABLE [tbl_roster_to_connected] (
    [roster_people_id] INTEGER NOT NULL,
    [to_be_connected] INTEGER NOT NULL,
    [position] INTEGER DEFAULT 0 NOT NULL,
    PRIMARY KEY ([roster_people_id], [to_be_connected])
) STRICT;
CREATE INDEX [idx_roster_to_connected_other] ON [tbl_roster_to_connected] ([to_be_connected]);

CREATE TABLE [tbl_roster_not_connected] (
    [roster_people_id] INTEGER NOT NULL,
    [not_to_be_connected] INTEGER NOT NULL,
    PRIMARY KEY ([roster_people_id], [not_to_be_connected])
) STRICT;
CREATE INDEX [idx_roster_not_connected_other] ON [tbl_roster_not_connected] ([not_to_be_connected]);

-- Who serves when. A person placed through several teams of a date has one row that names them all.
CREATE TABLE [tbl_roster_build] (
    [date_id] INTEGER NOT NULL,
    [roster_people_id] INTEGER NOT NULL,
    [team_memory1] INTEGER DEFAULT 0 NOT NULL,
    [team_memory2] INTEGER DEFAULT 0 NOT NULL,
    [team_memory3] INTEGER DEFAULT 0 NOT NULL,
    [team_memory4] INTEGER DEFAULT 0 NOT NULL,
    [team_memory5] INTEGER DEFAULT 0 NOT NULL,
    PRIMARY KEY ([date_id], [roster_people_id])
) STRICT;
CREATE INDEX [idx_roster_build_people] ON [tbl_roster_build] ([roster_people_id], [date_id]);

CREATE TABLE [tbl_roster_comment] (
    [date_id] INTEGER NOT NULL,
    [duty_id] INTEGER NOT NULL,
    [comment] TEXT,
    PRIMARY KEY ([date_id], [duty_id])
) STRICT;
CREATE INDEX [idx_roster_comment_duty] ON [tbl_roster_comment] ([duty_id]);

CREATE TABLE [tbl_roster_memo] (
    [date_id] INTEGER PRIMARY KEY,
    [Notes] TEXT
) STRICT;

-- The counts and the order of candidates that a build leaves behind.
CREATE TABLE [tbl_roster_max_table] (
    [Id] INTEGER NOT NULL,
    [kind] INTEGER DEFAULT 1 NOT NULL,              -- Id is 1 a person on a duty, 2 a team
    [roster_project_id] INTEGER DEFAULT 0 NOT NULL,
    [amount] INTEGER DEFAULT 0 NOT NULL,
    PRIMARY KEY ([Id], [kind])
) STRICT;
CREATE INDEX [idx_roster_max_table_project] ON [tbl_roster_max_table] ([roster_project_id]);

CREATE TABLE [tbl_Roster_sort_list] (
    [roster_project_id] INTEGER DEFAULT 0 NOT NULL,
    [duty_id] INTEGER DEFAULT 0 NOT NULL,
    [kind] INTEGER DEFAULT 1 NOT NULL,              -- ItemData is 1 a person on a duty, 2 a team
    [list] TEXT,
    [ItemData] INTEGER NOT NULL,
    [Count] INTEGER DEFAULT 0 NOT NULL,
    [primary_sort_order] INTEGER DEFAULT 0 NOT NULL
) STRICT;
CREATE INDEX [idx_roster_sort_list_duty] ON [tbl_Roster_sort_list] ([duty_id], [kind], [primary_sort_order]);
CREATE INDEX [idx_roster_sort_list_project] ON [tbl_Roster_sort_list] ([roster_project_id]);

-- The options of the last build.
CREATE TABLE [tbl_roster_build_setup] (
    [setup_id] INTEGER DEFAULT 1 NOT NULL PRIMARY KEY CHECK ([setup_id] = 1),
    [start] TEXT,
    [finish] TEXT,
    [clean_spots_first] INTEGER DEFAULT 0 NOT NULL,
    [order] INTEGER DEFAULT 0 NOT NULL,             -- 0 as listed, 1 A to Z, 2 Z to A, 3 random
    [seed] INTEGER DEFAULT 0 NOT NULL,              -- of the random order
    [enable_prority] INTEGER DEFAULT 0 NOT NULL,
    [people_priority] INTEGER DEFAULT 0 NOT NULL,
    [enable_team_prority] INTEGER DEFAULT 0 NOT NULL,
    [priority] INTEGER DEFAULT 0 NOT NULL,
    [enable_max_in] INTEGER DEFAULT 0 NOT NULL,
    [enable_team_max_in] INTEGER DEFAULT 0 NOT NULL,
    [duty_frequency] INTEGER DEFAULT -1 NOT NULL,
    [rule_do] INTEGER DEFAULT -1 NOT NULL,
    [rule_dont] INTEGER DEFAULT -1 NOT NULL,
    [ass_pos] INTEGER DEFAULT -1 NOT NULL,
    [ass_not] INTEGER DEFAULT -1 NOT NULL,
    [auto_analsysis] INTEGER DEFAULT -1 NOT NULL,
    [p_amount] INTEGER DEFAULT 0 NOT NULL           -- 0 not at all
) STRICT;

INSERT INTO [tbl_roster_build_setup] ([setup_id]) VALUES (1);

-- Selections of duties kept by name.
CREATE TABLE [tbl_roster_memory] (
    [memory_id] INTEGER PRIMARY KEY,
    [memory_name] TEXT,
    [position] INTEGER DEFAULT 0 NOT NULL
) STRICT;

CREATE TABLE [tbl_roster_memory_list] (
    [memory_id] INTEGER NOT NULL,
    [duty_id] INTEGER NOT NULL,
    [Selected] INTEGER DEFAULT 0 NOT NULL,
    [position] INTEGER DEFAULT 0 NOT NULL,
    PRIMARY KEY ([memory_id], [duty_id])
) STRICT;
CREATE INDEX [idx_roster_memory_list_duty] ON [tbl_roster_memory_list] ([duty_id]);

CREATE TABLE [tbl_roster_memory_events] (
    [memory_id] INTEGER NOT NULL,
    [event] INTEGER NOT NULL,                       -- the roster project
    PRIMARY KEY ([memory_id], [event])
) STRICT;
CREATE INDEX [idx_roster_memory_events_event] ON [tbl_roster_memory_events] ([event]);

-- The look of the roster on the screen.
CREATE TABLE [tbl_roster_view_setup] (
    [setup_id] INTEGER DEFAULT 1 NOT NULL PRIMARY KEY CHECK ([setup_id] = 1),
    [view_start] TEXT,
    [view_finish] TEXT,
    [stats_start] TEXT,
    [stats_finish] TEXT,
    [cell_sizing] INTEGER DEFAULT 0 NOT NULL,
    [cell_text_format] INTEGER DEFAULT 0 NOT NULL,
    [font_size] INTEGER DEFAULT 10 NOT NULL,
    [cell_text_position] INTEGER DEFAULT 0 NOT NULL,
    [shade] INTEGER DEFAULT 0 NOT NULL,
    [shading_style] INTEGER DEFAULT 0 NOT NULL,
    [bold] INTEGER DEFAULT 0 NOT NULL,
    [date_format] INTEGER DEFAULT 0 NOT NULL,       -- 0 long, 1 short name of the month
    [front_screen_surnames] INTEGER DEFAULT -1 NOT NULL,
    [team] INTEGER DEFAULT 0 NOT NULL,
    [substitute] INTEGER DEFAULT 0 NOT NULL
) STRICT;

INSERT INTO [tbl_roster_view_setup] ([setup_id]) VALUES (1);

-- The look of the roster on paper.
CREATE TABLE [tbl_roster_output_setup] (
    [setup_id] INTEGER DEFAULT 1 NOT NULL PRIMARY KEY CHECK ([setup_id] = 1),
    [layout] INTEGER DEFAULT 0 NOT NULL,            -- 0 portrait, 1 landscape
    [page_size] INTEGER DEFAULT 0 NOT NULL,
    [margin] INTEGER DEFAULT 0 NOT NULL,
    [font_size] INTEGER DEFAULT 10 NOT NULL,
    [narrow_font] INTEGER DEFAULT 0 NOT NULL,
    [cell_sizing] INTEGER DEFAULT 0 NOT NULL,
    [cell_text_format] INTEGER DEFAULT 0 NOT NULL,
    [cell_text_position] INTEGER DEFAULT 0 NOT NULL,
    [vertical_centering] INTEGER DEFAULT 0 NOT NULL,
    [date_format] INTEGER DEFAULT 0 NOT NULL,
    [bold_columns] INTEGER DEFAULT 0 NOT NULL,
    [bold_rows] INTEGER DEFAULT 0 NOT NULL,
    [darker_line] INTEGER DEFAULT 0 NOT NULL,
    [shade] INTEGER DEFAULT 0 NOT NULL,
    [shading_style] INTEGER DEFAULT 0 NOT NULL,
    [highlight_events] INTEGER DEFAULT 0 NOT NULL,
    [highlight_duties] INTEGER DEFAULT 0 NOT NULL,
    [substitute] INTEGER DEFAULT 0 NOT NULL,
    [comment] INTEGER DEFAULT -1 NOT NULL,
    [team] INTEGER DEFAULT 0 NOT NULL,
    [surnames] INTEGER DEFAULT -1 NOT NULL,
    [name_order] INTEGER DEFAULT 0 NOT NULL,        -- 0 by each person's own surname, 1 family by family
    [period_start] TEXT,
    [period_finish] TEXT
) STRICT;

INSERT INTO [tbl_roster_output_setup] ([setup_id]) VALUES (1);

CREATE TABLE [tbl_roster_grid_footer] (
    [content] TEXT,
    [position] INTEGER PRIMARY KEY
) STRICT;

-- The last e-mail of a roster.
CREATE TABLE [tbl_Roster_email_store] (
    [store_id] INTEGER DEFAULT 1 NOT NULL PRIMARY KEY CHECK ([store_id] = 1),
    [Subject] TEXT,
    [Message] TEXT,
    [message_format] INTEGER DEFAULT 0 NOT NULL,    -- 0 plain text, 1 HTML, 2 rich text
    [address_kind] INTEGER DEFAULT 2 NOT NULL,      -- 1 family, 2 individual, 3 business
    [sender_name] TEXT,
    [sender_address] TEXT,
    [tracking] INTEGER DEFAULT 0 NOT NULL
) STRICT;

INSERT INTO [tbl_Roster_email_store] ([store_id]) VALUES (1);
