drop table KWX_Port cascade constraints ;

create table KWX_Port (
   HARDWARE_SYSTEM_ID varchar2(64) NOT NULL,
   CONFIG_CHANGE_TYPE varchar2(12) NOT NULL,
   CONFIG_CHANGE_TIME varchar2(32) NOT NULL,
   Row_Index varchar2(5) NOT NULL,
   Name varchar2(16) NULL );

create unique index KWX_IPort on KWX_Port
(
   HARDWARE_SYSTEM_ID,
   CONFIG_CHANGE_TYPE,
   CONFIG_CHANGE_TIME,
   Row_Index
);

alter table KWX_Port add ( primary key ( HARDWARE_SYSTEM_ID, CONFIG_CHANGE_TYPE, Row_Index ));

drop view KWX_VPort;

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
   KWX_Port.HARDWARE_SYSTEM_ID;

insert into QUERY_VIEWS (VIEW_NAME) values ('KWX_VPort');
