-- Stored queries of the roster reports. Position is the place in the family where people are listed, as in the orders
-- of these reports. Duties and teams come project by project.

CREATE VIEW [qry_roster_report_duty_load] AS
SELECT y.[roster_project_id], j.[roster_project], j.[position] AS [project_position], y.[duty_id], y.[duty],
    y.[position]
FROM [tbl_roster_duty] y
JOIN [tbl_roster_project] j ON j.[roster_project_id] = y.[roster_project_id]
ORDER BY j.[position], y.[position], y.[duty_id];

CREATE VIEW [qry_roster_duty_report] AS
SELECT y.[duty_id], y.[roster_project_id], y.[duty], y.[position], y.[master_duty_id], y.[max_people], y.[max_team],
    y.[Frequency], y.[frequency_start], y.[pattern_pos], y.[one], y.[two], y.[three], y.[four], y.[five], y.[p_day],
    y.[Sunday], y.[Monday], y.[Tuesday], y.[Wednesday], y.[Thursday], y.[Friday], y.[Saturday], j.[roster_project],
    j.[position] AS [project_position], m.[master_duty]
FROM [tbl_roster_duty] y
JOIN [tbl_roster_project] j ON j.[roster_project_id] = y.[roster_project_id]
LEFT JOIN [tbl_roster_master_duty] m ON m.[master_duty_id] = y.[master_duty_id]
ORDER BY j.[position], y.[position], y.[duty_id];

CREATE VIEW [qry_roster_absence_report] AS
SELECT a.[roster_people_id], r.[person_id], r.[duty_id], y.[roster_project_id], a.[absent_from], a.[absent_to]
FROM [tbl_roster_absence] a
JOIN [tbl_roster_people] r ON r.[roster_people_id] = a.[roster_people_id]
JOIN [tbl_roster_duty] y ON y.[duty_id] = r.[duty_id]
ORDER BY a.[absent_from], a.[absent_to];

CREATE VIEW [qry_roster_report_team_load] AS
SELECT y.[roster_project_id], j.[roster_project], j.[position] AS [project_position], y.[duty_id], y.[duty],
    y.[position] AS [duty_position], t.[team_id], t.[team], t.[position]
FROM [tbl_roster_team] t
JOIN [tbl_roster_duty] y ON y.[duty_id] = t.[duty_id]
JOIN [tbl_roster_project] j ON j.[roster_project_id] = y.[roster_project_id]
ORDER BY j.[position], y.[position], t.[position], t.[team_id];

CREATE VIEW [qry_roster_report_output_team] AS
SELECT t.[team_id], t.[duty_id], t.[team], t.[position], t.[team_max], t.[team_priority_frequency],
    t.[team_leader_phone], t.[team_leader_out_of_group], t.[team_leader_name], t.[info], y.[duty],
    y.[position] AS [duty_position], y.[roster_project_id], j.[roster_project], j.[position] AS [project_position]
FROM [tbl_roster_team] t
JOIN [tbl_roster_duty] y ON y.[duty_id] = t.[duty_id]
JOIN [tbl_roster_project] j ON j.[roster_project_id] = y.[roster_project_id]
ORDER BY j.[position], y.[position], t.[position], t.[team_id];

CREATE VIEW [qry_roster_team_report] AS
SELECT m.[team_id], m.[team_leader], r.[duty_id], r.[roster_people_id], r.[person_id],
    r.[position] AS [list_position], p.[position], r.[display], r.[add_family], r.[substitute], p.[Surname_ID],
    f.[surname], p.[Name], f.[Primary_name], p.[preferred_name], p.[Preferred_Name_hidden], d.[other_surname],
    d.[surname_hidden],
    CASE WHEN d.[other_surname] IS NULL OR d.[surname_hidden] <> 0 THEN f.[surname] ELSE d.[other_surname] END
        AS [sort_surname],
    p.[sort_key]
FROM [tbl_roster_team_setup] m
JOIN [tbl_roster_people] r ON r.[roster_people_id] = m.[roster_people_id]
JOIN [tbl_people] p ON p.[person_id] = r.[person_id]
JOIN [tbl_surname] f ON f.[Surname_ID] = p.[Surname_ID]
LEFT JOIN [tbl_personal_details] d ON d.[person_id] = r.[person_id]
ORDER BY m.[team_id], r.[position], r.[roster_people_id];

-- The teams of a person.
CREATE VIEW [qry_roster_team_report_person] AS
SELECT r.[person_id], m.[roster_people_id], m.[team_id], m.[team_leader], t.[team], t.[duty_id], y.[duty],
    y.[roster_project_id], j.[roster_project]
FROM [tbl_roster_team_setup] m
JOIN [tbl_roster_people] r ON r.[roster_people_id] = m.[roster_people_id]
JOIN [tbl_roster_team] t ON t.[team_id] = m.[team_id]
JOIN [tbl_roster_duty] y ON y.[duty_id] = t.[duty_id]
JOIN [tbl_roster_project] j ON j.[roster_project_id] = y.[roster_project_id]
ORDER BY j.[position], y.[position], t.[position], m.[team_id];

-- Both sides of each association, with the project and duty of each.
CREATE VIEW [qry_roster_association_get_people1] AS
SELECT c.[roster_people_id], c.[to_be_connected], c.[position], one.[person_id], tbl_roster_duty.[duty_id],
    tbl_roster_duty.[duty], tbl_roster_duty.[roster_project_id], tbl_roster_project.[roster_project],
    r.[person_id] AS [other_person_id], tbl_roster_duty_1.[duty_id] AS [other_duty_id],
    tbl_roster_duty_1.[duty] AS [other_duty], tbl_roster_project_1.[roster_project_id] AS [other_roster_project_id],
    tbl_roster_project_1.[roster_project] AS [other_roster_project], p.[Surname_ID], f.[surname], p.[Name],
    p.[preferred_name], p.[Preferred_Name_hidden], d.[other_surname], d.[surname_hidden]
FROM [tbl_roster_to_connected] c
JOIN [tbl_roster_people] one ON one.[roster_people_id] = c.[roster_people_id]
JOIN [tbl_roster_duty] ON tbl_roster_duty.[duty_id] = one.[duty_id]
JOIN [tbl_roster_project] ON tbl_roster_project.[roster_project_id] = tbl_roster_duty.[roster_project_id]
JOIN [tbl_roster_people] r ON r.[roster_people_id] = c.[to_be_connected]
JOIN [tbl_roster_duty] tbl_roster_duty_1 ON tbl_roster_duty_1.[duty_id] = r.[duty_id]
JOIN [tbl_roster_project] tbl_roster_project_1
    ON tbl_roster_project_1.[roster_project_id] = tbl_roster_duty_1.[roster_project_id]
JOIN [tbl_people] p ON p.[person_id] = r.[person_id]
JOIN [tbl_surname] f ON f.[Surname_ID] = p.[Surname_ID]
LEFT JOIN [tbl_personal_details] d ON d.[person_id] = r.[person_id]
ORDER BY tbl_roster_project.[position], tbl_roster_duty.[position], c.[to_be_connected];

CREATE VIEW [qry_roster_association_get_people2] AS
SELECT c.[roster_people_id], c.[not_to_be_connected], one.[person_id], tbl_roster_duty.[duty_id],
    tbl_roster_duty.[duty], tbl_roster_duty.[roster_project_id], tbl_roster_project.[roster_project],
    r.[person_id] AS [other_person_id], tbl_roster_duty_1.[duty_id] AS [other_duty_id],
    tbl_roster_duty_1.[duty] AS [other_duty], tbl_roster_project_1.[roster_project_id] AS [other_roster_project_id],
    tbl_roster_project_1.[roster_project] AS [other_roster_project], p.[Surname_ID], f.[surname], p.[Name],
    p.[preferred_name], p.[Preferred_Name_hidden], d.[other_surname], d.[surname_hidden]
FROM [tbl_roster_not_connected] c
JOIN [tbl_roster_people] one ON one.[roster_people_id] = c.[roster_people_id]
JOIN [tbl_roster_duty] ON tbl_roster_duty.[duty_id] = one.[duty_id]
JOIN [tbl_roster_project] ON tbl_roster_project.[roster_project_id] = tbl_roster_duty.[roster_project_id]
JOIN [tbl_roster_people] r ON r.[roster_people_id] = c.[not_to_be_connected]
JOIN [tbl_roster_duty] tbl_roster_duty_1 ON tbl_roster_duty_1.[duty_id] = r.[duty_id]
JOIN [tbl_roster_project] tbl_roster_project_1
    ON tbl_roster_project_1.[roster_project_id] = tbl_roster_duty_1.[roster_project_id]
JOIN [tbl_people] p ON p.[person_id] = r.[person_id]
JOIN [tbl_surname] f ON f.[Surname_ID] = p.[Surname_ID]
LEFT JOIN [tbl_personal_details] d ON d.[person_id] = r.[person_id]
ORDER BY tbl_roster_project.[position], tbl_roster_duty.[position], c.[not_to_be_connected];

-- Who was placed where and when.
CREATE VIEW [qry_roster_participation] AS
SELECT y.[roster_project_id], j.[roster_project], r.[duty_id], y.[duty], b.[date_id], x.[date], r.[roster_people_id],
    r.[person_id], p.[position], b.[team_memory1], b.[team_memory2], b.[team_memory3], b.[team_memory4],
    b.[team_memory5], p.[Surname_ID], f.[surname], p.[Name], f.[Primary_name], p.[preferred_name],
    p.[Preferred_Name_hidden], d.[other_surname], d.[surname_hidden],
    CASE WHEN d.[other_surname] IS NULL OR d.[surname_hidden] <> 0 THEN f.[surname] ELSE d.[other_surname] END
        AS [sort_surname],
    p.[sort_key], f.[sort_key] AS [family_sort_key], p.[Active], p.[Decease], p.[Privacy], p.[Prospect], p.[archive],
    p.[contact], f.[Condition]
FROM [tbl_roster_build] b
JOIN [tbl_roster_people] r ON r.[roster_people_id] = b.[roster_people_id]
JOIN [tbl_roster_date] x ON x.[date_id] = b.[date_id]
JOIN [tbl_people] p ON p.[person_id] = r.[person_id]
JOIN [tbl_surname] f ON f.[Surname_ID] = p.[Surname_ID]
LEFT JOIN [tbl_personal_details] d ON d.[person_id] = r.[person_id]
JOIN [tbl_roster_duty] y ON y.[duty_id] = r.[duty_id]
JOIN [tbl_roster_project] j ON j.[roster_project_id] = y.[roster_project_id];

CREATE VIEW [qry_roster_participation_sub] AS
SELECT r.[person_id], y.[roster_project_id], j.[roster_project], r.[duty_id], y.[duty], b.[date_id], x.[date],
    b.[roster_people_id], b.[team_memory1], b.[team_memory2], b.[team_memory3], b.[team_memory4], b.[team_memory5]
FROM [tbl_roster_build] b
JOIN [tbl_roster_people] r ON r.[roster_people_id] = b.[roster_people_id]
JOIN [tbl_roster_date] x ON x.[date_id] = b.[date_id]
JOIN [tbl_roster_duty] y ON y.[duty_id] = r.[duty_id]
JOIN [tbl_roster_project] j ON j.[roster_project_id] = y.[roster_project_id]
ORDER BY x.[date], j.[position], y.[position];

-- The amounts of the dates of a period add up to those of the period.
CREATE VIEW [qry_roster_participation_sub_stats] AS
SELECT r.[person_id], y.[roster_project_id], j.[roster_project], j.[position] AS [project_position], r.[duty_id],
    y.[duty], y.[position] AS [duty_position], x.[date], COUNT(*) AS [amount]
FROM [tbl_roster_build] b
JOIN [tbl_roster_people] r ON r.[roster_people_id] = b.[roster_people_id]
JOIN [tbl_roster_date] x ON x.[date_id] = b.[date_id]
JOIN [tbl_roster_duty] y ON y.[duty_id] = r.[duty_id]
JOIN [tbl_roster_project] j ON j.[roster_project_id] = y.[roster_project_id]
GROUP BY r.[person_id], y.[roster_project_id], j.[roster_project], j.[position], r.[duty_id], y.[duty], y.[position],
    x.[date]
ORDER BY j.[position], y.[position], x.[date];

-- Everybody on a duty: who was placed in a period is left out by the reader.
CREATE VIEW [qry_roster_non_participation] AS
SELECT y.[roster_project_id], j.[roster_project], j.[position] AS [project_position], r.[duty_id], y.[duty],
    y.[position] AS [duty_position], r.[roster_people_id], r.[person_id], r.[position] AS [list_position],
    p.[position], p.[Surname_ID], f.[surname], p.[Name], f.[Primary_name], p.[preferred_name],
    p.[Preferred_Name_hidden], d.[other_surname], d.[surname_hidden],
    CASE WHEN d.[other_surname] IS NULL OR d.[surname_hidden] <> 0 THEN f.[surname] ELSE d.[other_surname] END
        AS [sort_surname],
    p.[sort_key], f.[sort_key] AS [family_sort_key], p.[Active], p.[Decease], p.[Privacy], p.[Prospect], p.[archive],
    p.[contact], f.[Condition]
FROM [tbl_roster_people] r
JOIN [tbl_people] p ON p.[person_id] = r.[person_id]
JOIN [tbl_surname] f ON f.[Surname_ID] = p.[Surname_ID]
LEFT JOIN [tbl_personal_details] d ON d.[person_id] = r.[person_id]
JOIN [tbl_roster_duty] y ON y.[duty_id] = r.[duty_id]
JOIN [tbl_roster_project] j ON j.[roster_project_id] = y.[roster_project_id];

CREATE VIEW [qry_roster_report_duty_people] AS
SELECT y.[roster_project_id], j.[roster_project], j.[position] AS [project_position], r.[duty_id], y.[duty],
    y.[position] AS [duty_position], r.[roster_people_id], r.[person_id], r.[position] AS [list_position],
    p.[position], p.[Surname_ID], f.[surname], p.[Name], f.[Primary_name], p.[preferred_name],
    p.[Preferred_Name_hidden], d.[other_surname], d.[surname_hidden],
    CASE WHEN d.[other_surname] IS NULL OR d.[surname_hidden] <> 0 THEN f.[surname] ELSE d.[other_surname] END
        AS [sort_surname],
    p.[sort_key], f.[sort_key] AS [family_sort_key], p.[Active], p.[Decease], p.[Privacy], p.[Prospect], p.[archive],
    p.[contact], f.[Condition], r.[display], r.[add_family], r.[substitute], r.[people_max],
    r.[people_priority_frequency]
FROM [tbl_roster_people] r
JOIN [tbl_people] p ON p.[person_id] = r.[person_id]
JOIN [tbl_surname] f ON f.[Surname_ID] = p.[Surname_ID]
LEFT JOIN [tbl_personal_details] d ON d.[person_id] = r.[person_id]
JOIN [tbl_roster_duty] y ON y.[duty_id] = r.[duty_id]
JOIN [tbl_roster_project] j ON j.[roster_project_id] = y.[roster_project_id];

CREATE VIEW [qry_roster_duty_report_person] AS
SELECT r.[person_id], r.[roster_people_id], y.[roster_project_id], j.[roster_project], r.[duty_id], y.[duty],
    r.[position], r.[display], r.[add_family], r.[substitute], r.[people_max], r.[people_priority_frequency]
FROM [tbl_roster_people] r
JOIN [tbl_roster_duty] y ON y.[duty_id] = r.[duty_id]
JOIN [tbl_roster_project] j ON j.[roster_project_id] = y.[roster_project_id]
ORDER BY j.[position], y.[position], r.[roster_people_id];

CREATE VIEW [qry_roster_report_association_people] AS
SELECT y.[roster_project_id], j.[roster_project], j.[position] AS [project_position], r.[duty_id], y.[duty],
    y.[position] AS [duty_position], r.[roster_people_id], r.[person_id], r.[position] AS [list_position],
    p.[position], p.[Surname_ID], f.[surname], p.[Name], f.[Primary_name], p.[preferred_name],
    p.[Preferred_Name_hidden], d.[other_surname], d.[surname_hidden],
    CASE WHEN d.[other_surname] IS NULL OR d.[surname_hidden] <> 0 THEN f.[surname] ELSE d.[other_surname] END
        AS [sort_surname],
    p.[sort_key], f.[sort_key] AS [family_sort_key], p.[Active], p.[Decease], p.[Privacy], p.[Prospect], p.[archive],
    p.[contact], f.[Condition]
FROM [tbl_roster_people] r
JOIN [tbl_people] p ON p.[person_id] = r.[person_id]
JOIN [tbl_surname] f ON f.[Surname_ID] = p.[Surname_ID]
LEFT JOIN [tbl_personal_details] d ON d.[person_id] = r.[person_id]
JOIN [tbl_roster_duty] y ON y.[duty_id] = r.[duty_id]
JOIN [tbl_roster_project] j ON j.[roster_project_id] = y.[roster_project_id];

CREATE VIEW [qry_roster_report_availability_people] AS
SELECT y.[roster_project_id], j.[roster_project], j.[position] AS [project_position], r.[duty_id], y.[duty],
    y.[position] AS [duty_position], r.[roster_people_id], r.[person_id], r.[position] AS [list_position],
    p.[position], p.[Surname_ID], f.[surname], p.[Name], f.[Primary_name], p.[preferred_name],
    p.[Preferred_Name_hidden], d.[other_surname], d.[surname_hidden],
    CASE WHEN d.[other_surname] IS NULL OR d.[surname_hidden] <> 0 THEN f.[surname] ELSE d.[other_surname] END
        AS [sort_surname],
    p.[sort_key], f.[sort_key] AS [family_sort_key], p.[Active], p.[Decease], p.[Privacy], p.[Prospect], p.[archive],
    p.[contact], f.[Condition], r.[Sunday], r.[Monday], r.[Tuesday], r.[Wednesday], r.[Thursday], r.[Friday],
    r.[Saturday], r.[absent_day], r.[absent_1st], r.[absent_2nd], r.[absent_3rd], r.[absent_4th], r.[absent_5th],
    r.[every_week], r.[every_day], r.[every_start], r.[every_Sunday], r.[every_Monday], r.[every_Tuesday],
    r.[every_Wednesday], r.[every_Thursday], r.[every_Friday], r.[every_Saturday]
FROM [tbl_roster_people] r
JOIN [tbl_people] p ON p.[person_id] = r.[person_id]
JOIN [tbl_surname] f ON f.[Surname_ID] = p.[Surname_ID]
LEFT JOIN [tbl_personal_details] d ON d.[person_id] = r.[person_id]
JOIN [tbl_roster_duty] y ON y.[duty_id] = r.[duty_id]
JOIN [tbl_roster_project] j ON j.[roster_project_id] = y.[roster_project_id];

CREATE VIEW [qry_roster_availability_report_person] AS
SELECT r.[person_id], r.[roster_people_id], y.[roster_project_id], j.[roster_project], r.[duty_id], y.[duty],
    r.[position], r.[Sunday], r.[Monday], r.[Tuesday], r.[Wednesday], r.[Thursday], r.[Friday], r.[Saturday],
    r.[absent_day], r.[absent_1st], r.[absent_2nd], r.[absent_3rd], r.[absent_4th], r.[absent_5th], r.[every_week],
    r.[every_day], r.[every_start], r.[every_Sunday], r.[every_Monday], r.[every_Tuesday], r.[every_Wednesday],
    r.[every_Thursday], r.[every_Friday], r.[every_Saturday]
FROM [tbl_roster_people] r
JOIN [tbl_roster_duty] y ON y.[duty_id] = r.[duty_id]
JOIN [tbl_roster_project] j ON j.[roster_project_id] = y.[roster_project_id]
ORDER BY j.[position], y.[position], r.[roster_people_id];

-- Rosters sent and printed, the newest first, with those whom they were for.
CREATE VIEW [qry_roster_email_history] AS
SELECT h.[email_history_id], h.[sent], h.[finished], h.[user_id], h.[sender_name], h.[sender_address], h.[subject],
    h.[message], h.[message_format], h.[cancelled], h.[failure], h.[roster_projects], h.[period_start],
    h.[period_finish], n.[position], n.[surname_id], n.[person_id], n.[recipient], n.[address], n.[address_kind],
    n.[tracking_copy], n.[outcome], n.[reason], n.[sent] AS [recipient_sent]
FROM [tbl_email_history] h
LEFT JOIN [tbl_email_history_recipient] n ON n.[email_history_id] = h.[email_history_id]
WHERE h.[area] = 2
ORDER BY h.[email_history_id] DESC, n.[position];

CREATE VIEW [qry_roster_print_history] AS
SELECT h.[print_history_id], h.[printed], h.[user_id], h.[report], h.[title], h.[criteria], h.[printer], h.[pages],
    h.[copies], h.[cancelled], h.[roster_projects], h.[period_start], h.[period_finish], n.[position], n.[surname_id],
    n.[person_id], n.[recipient]
FROM [tbl_print_history] h
LEFT JOIN [tbl_print_history_person] n ON n.[print_history_id] = h.[print_history_id]
WHERE h.[area] = 2
ORDER BY h.[print_history_id] DESC, n.[position];
