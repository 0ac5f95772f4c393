drop table KWX_Port
go

create table KWX_Port (
   HARDWARE_SYSTEM_ID varchar(64) NOT NULL,
   CONFIG_CHANGE_TYPE varchar(12) NOT NULL,
   CONFIG_CHANGE_TIME varchar(32) NOT NULL,
   Row_Index varchar(5) NOT NULL,
   Name varchar(16) NULL )
go

alter table KWX_Port add primary key ( HARDWARE_SYSTEM_ID, CONFIG_CHANGE_TYPE, Row_Index )
go

drop view KWX_VPort
go

create view KWX_VPort
as
select
   COMPUTER_SYSTEM.QVE_OBJECT_ID,
   COMPUTER_SYSTEM.QVE_OBJECT_LABEL,
   KWX_Port.*
from
   COMPUTER_SYSTEM, KWX_Port
where
   COMPUTER_SYSTEM.HARDWARE_SYSTEM_ID =
   KWX_Port.HARDWARE_SYSTEM_ID
go

insert into QUERY_VIEWS (VIEW_NAME) values ('KWX_VPort')
go
